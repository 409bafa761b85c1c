// A long text to scroll and to search: a file, or what the program itself has logged.
#include <MW/ime.h>
#include <MW/static_text.h>
#include <MW/window.h>

#include <array>
#include <memory>
#include <mutex>
#include <optional>
#include <string>

#include "button_row.h"
#include "current.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr uint32_t kPaper = 0xFFF4F4EC;
constexpr uint32_t kKeyboardColor = 0xFF3C4A60;
constexpr int kTopPercent = 34;    // of the screen's height, and so the next
constexpr int kViewPercent = 38;   // of the viewer by itself
constexpr int kAbovePercent = 16;  // of the viewer above the keyboard
constexpr int kKeyboardPercent = 29;

/// The viewer with what the page tells of a search.
class Viewer : public MW::StaticText {
 public:
  Viewer(const SKIA_Rect* area, const SKIA_Text* looks)
      : StaticText(area, looks, true, true, true) {}
  ~Viewer() override { leaveLayers(); }
  std::size_t matches() const {
    const std::lock_guard guard(stateLock);
    return found_lines.size();
  }
};

/// Drag it, or hold the scroll bar, to scroll. The buttons open the keyboard and go from match to
/// match, as the keys up and down do; the fold key closes the keyboard.
class LogTest : public PageTest {
 public:
  explicit LogTest(const Context& program)
      : PageTest("Log",
                 "Drag to scroll. Search, then Previous\nand Next, or the keys up and down."),
        text(program.logText ? *program.logText : program.log.text()) {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) {
      if (code == MW::kKeyUp) self().jump(Viewer::kPrevious);
      if (code == MW::kKeyDown) self().jump(Viewer::kNext);
    };
    placeViewer();
    placeKeyboard();
    buttons.emplace(rowOf(screenSize(), 74, 6, kButtonColor), kFaces);
  }

  void leave() override {
    buttons.reset();
    keyboard.reset();
    viewer.reset();
    page.endAsking();
  }

 private:
  static LogTest& self() { return Current<LogTest>::get(); }

  static const std::array<ButtonRow::Face, 3> kFaces;

  void placeViewer() {
    const ScreenSize screen = screenSize();
    const SKIA_Rect area = rowOf(screen, kTopPercent, kViewPercent, kPaper);
    const SKIA_Text looks = textOf("", MW::kColorBlack, SKIA_ALIGN_LEFT, smallTextSize(screen));
    viewer.emplace(&area, &looks);
    viewer->setRect(MW::kUnused, &area);  // room for the line numbers
    viewer->setText(text.c_str());
    viewer->setActive(1);
  }

  void placeKeyboard() {
    const SKIA_Rect area =
        rowOf(screenSize(), kTopPercent + kAbovePercent + 1, kKeyboardPercent, kKeyboardColor);
    const SKIA_Text looks = captionOf("");
    keyboard.emplace(&area, &looks);
    keyboard->release_cb = [](int, MW::Ime* from) { self().follow(*from); };
  }

  // The keyboard takes the place of the viewer's lower part and of the buttons.
  void showKeyboard(bool isShown) {
    const SKIA_Rect area =
        rowOf(screenSize(), kTopPercent, isShown ? kAbovePercent : kViewPercent, kPaper);
    viewer->setRect(MW::kUnused, &area);
    keyboard->setActive(isShown ? 1 : 0);
    buttons->setActive(!isShown);
    MW::isDisplayUpdate(1);
  }

  void openKeyboard() {
    keyboard->typing_reset();
    keyboard->set_fold_status(false);
    showKeyboard(true);
  }

  void follow(MW::Ime& from) {
    const std::string wanted = from.getResultString();
    if (!wanted.empty()) {
      from.typing_reset();
      search(wanted);
    }
    if (!wanted.empty() || from.get_fold_status()) showKeyboard(false);
  }

  void search(const std::string& wanted) {
    viewer->get_ime_result(wanted.c_str());
    viewer->line_search(text.c_str());
    page.say((std::to_string(viewer->matches()) + " x " + wanted).c_str());
  }

  void jump(Viewer::SearchDirection direction) {
    viewer->line_search_point(direction);
    MW::isDisplayUpdate(1);
  }

  Current<LogTest> current{this};
  const std::string text;
  std::optional<Viewer> viewer;
  std::optional<MW::Ime> keyboard;
  std::optional<ButtonRow> buttons;
};

const std::array<ButtonRow::Face, 3> LogTest::kFaces = {{
    {"Search", [](int) { self().openKeyboard(); }},
    {"Previous", [](int) { self().jump(Viewer::kPrevious); }},
    {"Next", [](int) { self().jump(Viewer::kNext); }},
}};

}  // namespace

std::unique_ptr<Test> makeLogView(const Context& context) {
  return std::make_unique<LogTest>(context);
}

}  // namespace factory_test
