// Six large faces of which one is chosen.
#include <MW/dialog_select.h>

#include <array>
#include <atomic>
#include <memory>
#include <optional>
#include <string>

#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr auto kChoices = std::to_array<const char*>({"2G", "3G", "4G", "5G", "BT", "FM"});

/// A choice, and the keys select and back, end the look.
class SixChoiceTest : public LookTest {
 public:
  SixChoiceTest() : LookTest(tr("Six-way choice"), tr("Choose one.")) {}

  void drawOver() override {
    constexpr int kBelowDialog = 91;  // per cent of the screen's height
    if (page.isAsking()) return;
    const ScreenSize screen = screenSize();
    const int top = percentOf(screen.height, kBelowDialog);
    page.drawHint(within({0, top, screen.width, screen.height - top, 0}, gapOf(screen)));
  }

 protected:
  void beginLook() override {
    dialog.emplace(MW::kUnused).setTitle(tr("Radio?"));
    for (std::size_t i = 0; i < kChoices.size(); ++i) {
      dialog->setText_str(static_cast<unsigned int>(i), kChoices.at(i));
    }
    dialog->choiceCallback = [](MW::mouse_event* mouse) { self().choose(mouse->state); };
    dialog->keyPressCallback = [](MW::kbd_event* event) { self().finishLookOn(event->code); };
    dialog->setActive(1);
  }

  void endLook() override { dialog.reset(); }

  std::string question() const override {
    const unsigned int number = chosen;
    if (number == 0) return tr("Did all choices look right?");
    return std::string(kChoices.at(number - 1)) + tr(". Was that your choice?");
  }

 private:
  static SixChoiceTest& self() { return Current<SixChoiceTest>::get(); }

  void choose(unsigned int number) {
    chosen = number;
    finishLook();
  }

  Current<SixChoiceTest> current{this};
  std::atomic<unsigned int> chosen = 0;  // 1 to 6; 0: none
  std::optional<MW::DialogSelect> dialog;
};

}  // namespace

std::unique_ptr<Test> makeSixChoice(const Context&) { return std::make_unique<SixChoiceTest>(); }

}  // namespace factory_test
