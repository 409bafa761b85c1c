// A long text to scroll and to search: a file, or what the program itself has logged.
#include <MW/ime.h>
#include <MW/static_text.h>
#include <MW/window.h>

#include <algorithm>
#include <array>
#include <memory>
#include <mutex>
#include <optional>
#include <string>

#include "button_row.h"
#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"
#include "text_fit.h"

namespace factory_test {

namespace {

constexpr uint32_t kPaper = 0xFFF4F4EC;
constexpr std::size_t kMostLines = 99999;  // what the viewer can number

// Where the viewer stands by itself, and what is below it; with the keyboard it keeps the top part.
struct LogLayout {
  SKIA_Rect view;
  SKIA_Rect buttons;
  SKIA_Rect shortView;
  SKIA_Rect keyboard;
};

LogLayout layOutLog() {
  const int gap = gapOf(screenSize());
  const auto [view, buttons] = rowsOf<2>(contentArea(), gap, {7, 1});
  const auto [shortView, keyboard] = rowsOf<2>(contentArea(), gap, {2, 3});
  return {inColor(view, kPaper), buttons, inColor(shortView, kPaper),
          inColor(keyboard, kPanelInk.ground)};
}

// The newest lines that can be numbered; `left` is how many are left out.
std::string newestLines(std::string text, std::size_t& left) {
  const auto lines = static_cast<std::size_t>(std::ranges::count(text, '\n'));
  left = lines > kMostLines ? lines - kMostLines : 0;
  std::size_t from = 0;
  for (std::size_t i = 0; i < left; ++i) from = text.find('\n', from) + 1;
  return from == 0 ? text : text.substr(from);
}

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
      : PageTest(tr("Log"),
                 tr("Drag to scroll. Search, then Previous\nand Next, or the keys up and down.")),
        text(newestLines(program.logText ? *program.logText : program.log.text(), leftOut)) {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) {
      if (code == MW::kKeyUp) self().jump(Viewer::kPrevious);
      if (code == MW::kKeyDown) self().jump(Viewer::kNext);
    };
    placeViewer();
    placeKeyboard();
    buttons.emplace(layOutLog().buttons, kFaces);
    if (leftOut > 0) {
      const char* const words = trn("%1 older line is left out", "%1 older lines are left out",
                                    static_cast<unsigned long>(leftOut));
      page.say(filled(words, {std::to_string(leftOut)}).c_str());
    }
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
    const SKIA_Rect area = layOutLog().view;
    const int size = smallTextSize(screenSize());
    const SKIA_Text looks = textOf("", kDark, SKIA_ALIGN_LEFT, size);
    viewer.emplace(&area, &looks);
    const SKIA_Rect narrow = cutFor(area, size);
    viewer->setRect(MW::kUnused, &narrow);  // also makes room for the line numbers
    viewer->setText(text.c_str());
    viewer->setRect(MW::kUnused, &area);
    viewer->setActive(1);
  }

  // The viewer cuts rows for letters of a usual width. An area for which it cuts them so short that
  // wide letters, too, end before the scroll bar.
  SKIA_Rect cutFor(SKIA_Rect area, int size) const {
    constexpr int kUsualPercent = 63;  // of the size, the viewer's letter
    constexpr int kNumberLetters = 8;
    constexpr int kBarParts = 10;  // the scroll bar and the margins of the width
    const int letter = std::max(percentOf(size, kUsualPercent), 1);
    const auto usual = static_cast<std::size_t>(std::max(area.w / letter - kNumberLetters, 1));
    const int width = area.w - area.w / kBarParts - 4 * size;
    const std::size_t fitting = bytesThatFit(text, size, width, usual);
    area.w = static_cast<int>(fitting + kNumberLetters) * size * kUsualPercent / 100;
    return area;
  }

  void placeKeyboard() {
    const SKIA_Rect area = layOutLog().keyboard;
    const SKIA_Text looks = captionOf("");
    keyboard.emplace(&area, &looks);
    keyboard->release_cb = [](int, MW::Ime* from) { self().follow(*from); };
  }

  // The keyboard takes the place of the viewer's lower part and of the buttons.
  void showKeyboard(bool isShown) {
    const LogLayout layout = layOutLog();
    viewer->setRect(MW::kUnused, isShown ? &layout.shortView : &layout.view);
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
  std::size_t leftOut = 0;
  const std::string text;
  std::optional<Viewer> viewer;
  std::optional<MW::Ime> keyboard;
  std::optional<ButtonRow> buttons;
};

const std::array<ButtonRow::Face, 3> LogTest::kFaces = {{
    {msg("Search"), [](int) { self().openKeyboard(); }},
    {msg("Previous"), [](int) { self().jump(Viewer::kPrevious); }},
    {msg("Next"), [](int) { self().jump(Viewer::kNext); }},
}};

}  // namespace

std::unique_ptr<Test> makeLogView(const Context& context) {
  return std::make_unique<LogTest>(context);
}

}  // namespace factory_test
