// Dialogs whose words the application gives.
#include <MW/dialog_new.h>
#include <MW/dialog_slide.h>

#include <array>
#include <memory>
#include <string>

#include "current.h"
#include "language/language.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

/// A touch, too, shows the next dialog; the slide of the last one ends the look.
class FreeFormTest : public StepTest {
 public:
  FreeFormTest()
      : StepTest(tr("Free-form dialogs"),
                 tr("Tap through all dialogs, then say\nwhether each of them looked right.")) {}

 protected:
  std::string question() const override { return tr("Did all dialogs look right?"); }
  int lastStep() const override { return static_cast<int>(kSteps.size()) - 1; }

  void showStep(int step) override {
    dialog.reset();
    (this->*kSteps.at(static_cast<std::size_t>(step)))();
    dialog->setActive(1);
    page.say((tr("Dialog ") + std::to_string(step + 1)).c_str());
  }

  void endSteps() override { dialog.reset(); }

 private:
  static FreeFormTest& self() { return Current<FreeFormTest>::get(); }
  static void next(MW::mouse_event*) { self().moveOn(); }
  static void follow(MW::kbd_event* event) { self().followKey(event->code); }

  MW::DialogNew& put(const char* title) {
    auto made = std::make_unique<MW::DialogNew>(title, SKIA_ALIGN_CENTRE,
                                                static_cast<int>(MW::kColorHighlight));
    made->clickCallback = next;
    made->keyPressCallback = follow;
    MW::DialogNew& kept = *made;
    dialog = std::move(made);
    return kept;
  }

  void putWords() { put(tr("Words")).setDesc(tr("One line"), nullptr, nullptr); }

  void putOneButton() {
    MW::DialogNew& made = put(tr("Button"));
    made.setDesc(tr("Two lines,"), tr("one above the other"), nullptr);
    made.setbutton(tr("OK"), nullptr);
  }

  void putTwoButtons() {
    MW::DialogNew& made = put(tr("Buttons"));
    made.setDesc(tr("Three lines"), tr("in the middle"), tr("of the dialog"), SKIA_ALIGN_CENTRE);
    made.setbutton(tr("YES"), tr("NO"));
  }

  void putProgress() {
    MW::DialogNew& made = put(tr("Progress"));
    made.setDesc(tr("Something goes on"), nullptr, nullptr);
    made.setProgress(MW::kUnused);
  }

  void putSlide() {
    auto made = std::make_unique<MW::DialogSlide>(MW::DialogSlide::kRepeatPassedTest);
    made->leftCallback = [](int) { self().finishLook(); };
    made->rightCallback = [](int) { self().finishLook(); };
    made->keyPressCallback = follow;
    dialog = std::move(made);
  }

  using Put = void (FreeFormTest::*)();
  static constexpr std::array<Put, 5> kSteps = {
      &FreeFormTest::putWords,    &FreeFormTest::putOneButton, &FreeFormTest::putTwoButtons,
      &FreeFormTest::putProgress, &FreeFormTest::putSlide,
  };

  Current<FreeFormTest> current{this};
  std::unique_ptr<MW::Widget> dialog;
};

}  // namespace

std::unique_ptr<Test> makeFreeForm(const Context&) { return std::make_unique<FreeFormTest>(); }

}  // namespace factory_test
