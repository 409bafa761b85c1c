// Pages of one colour with texts anywhere on them.
#include <MW/auto_cap_screen.h>
#include <MW/dialog_warn.h>

#include <memory>
#include <string>

#include "current.h"
#include "language/language.h"
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
  WarningTest()
      : StepTest(tr("Warning pages"),
                 tr("Tap through both pages, then say\nwhether each of them looked right.")) {}

 protected:
  std::string question() const override { return tr("Did both pages look right?"); }
  int lastStep() const override { return 1; }

  void showStep(int step) override {
    warning.reset();
    if (step == 0) {
      put(std::make_unique<MW::DialogWarn>(kAlarm), tr("Warning"), tr("Do not switch off"));
    } else {
      auto calm = std::make_unique<MW::AutoCapScreen>(kCalm);
      calm->setBgColor(kCalm);
      put(std::move(calm), tr("Automatic test"), tr("Do not touch"));
    }
  }

  void endSteps() override { warning.reset(); }

 private:
  template <typename Kind>
  void put(std::unique_ptr<Kind> made, const char* title, const char* words) {
    const ScreenSize screen = screenSize();
    const uint32_t ground = made->getBgColor();
    const SKIA_Rect whole = {0, 0, screen.width, screen.height, ground};
    const auto rows = rowsOf<5>(within(whole, gapOf(screen)), 0, {4, 1, 1, 1, 6});
    made->setText(0, rows[1], captionIn(rows[1], title, MW::kColorWhite));
    made->setText(1, inColor(rows[3], kButtonInk.ground),
                  captionIn(rows[3], words, kButtonInk.text));
    made->touchReleaseCallback = [](MW::mouse_event*) { self().moveOn(); };
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
