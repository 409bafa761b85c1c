// Every built-in dialog, one after another.
#include <MW/dialog.h>

#include <memory>
#include <optional>
#include <string>

#include "current.h"
#include "language/language.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

/// A touch, too, shows the next kind.
class PromptTest : public StepTest {
 public:
  PromptTest()
      : StepTest(tr("Built-in dialogs"),
                 tr("Tap through all dialogs, then say\nwhether each of them looked right.")) {}

 protected:
  std::string question() const override { return tr("Did all dialogs look right?"); }
  int lastStep() const override { return MW::Dialog::kLeaveLightSensor; }

  void showStep(int kind) override {
    dialog.reset();
    MW::Dialog& made = dialog.emplace(kind);
    made.clickCallback = [](MW::mouse_event*) { Current<PromptTest>::get().moveOn(); };
    made.hookKeyCallback = [](int) { Current<PromptTest>::get().move(1); };
    made.keyPressCallback = [](MW::kbd_event* event) {
      Current<PromptTest>::get().followKey(event->code);
    };
    made.setActive(1);
    page.say((tr("Dialog of kind ") + std::to_string(kind)).c_str());
  }

  void endSteps() override { dialog.reset(); }

 private:
  Current<PromptTest> current{this};
  std::optional<MW::Dialog> dialog;
};

}  // namespace

std::unique_ptr<Test> makePrompts(const Context&) { return std::make_unique<PromptTest>(); }

}  // namespace factory_test
