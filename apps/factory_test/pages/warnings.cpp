// Pages of one colour with texts anywhere on them.
#include <MW/auto_cap_screen.h>
#include <MW/dialog_warn.h>

#include <memory>
#include <string>

#include "current.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr uint32_t kAlarm = 0xFFC02020;
constexpr uint32_t kCalm = 0xFF205080;

/// A touch, too, shows the next page. Two releases of one key end the look.
class WarningTest : public StepTest {
 public:
  WarningTest() : StepTest("Warning pages", "Touch for the next page.") {}

 protected:
  std::string question() const override { return "Did both pages look right?"; }
  int lastStep() const override { return 1; }

  void showStep(int step) override {
    warning.reset();
    if (step == 0) {
      put(std::make_unique<MW::DialogWarn>(kAlarm), "Warning", "Do not switch off");
    } else {
      auto calm = std::make_unique<MW::AutoCapScreen>(kCalm);
      calm->setBgColor(kCalm);
      put(std::move(calm), "Automatic test", "Do not touch");
    }
  }

  void endLook() override { warning.reset(); }

 private:
  template <typename Kind>
  void put(std::unique_ptr<Kind> made, const char* title, const char* words) {
    const ScreenSize screen = screenSize();
    const uint32_t ground = made->getBgColor();
    made->setText(0, rowOf(screen, 30, 8, ground), captionOf(title, MW::kColorWhite));
    made->setText(1, rowOf(screen, 42, 8, MW::kColorWhite), captionOf(words));
    made->touchReleaseCallback = [](MW::mouse_event*) { self().move(1); };
    made->keyPressCallback = [](MW::kbd_event* event) { self().followKey(event->code); };
    made->doubleKeyCallback = [](MW::kbd_event*) { self().finishLook(); };
    made->setActive(1);
    warning = std::move(made);
  }

  static WarningTest& self() { return Current<WarningTest>::get(); }

  Current<WarningTest> current{this};
  std::unique_ptr<MW::Widget> warning;
};

}  // namespace

std::unique_ptr<Test> makeWarnings(const Context&) { return std::make_unique<WarningTest>(); }

}  // namespace factory_test
