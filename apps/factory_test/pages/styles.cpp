// Push buttons without a highlight, in all their styles.
#include <MW/button.h>
#include <MW/button_new.h>
#include <MW/button_s.h>

#include <array>
#include <memory>
#include <string>
#include <utility>

#include "current.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

using MakeButton = std::unique_ptr<MW::Widget> (*)(const SKIA_Rect& area, const SKIA_Text& caption);

template <typename Kind, int style>
std::unique_ptr<MW::Widget> makeStyled(const SKIA_Rect& area, const SKIA_Text& caption) {
  return std::make_unique<Kind>(style, &area, &caption);
}

std::unique_ptr<MW::Widget> makePlain(const SKIA_Rect& area, const SKIA_Text& caption) {
  return std::make_unique<MW::Button>(&area, &caption);
}

struct StyleRow {
  const char* name;
  int top;  // per cent of the screen's height, and so the next
  int height;
  int column;
  int columns;
  uint32_t color;
  MakeButton make;
};

// Events come to the last but one first, and it lets the last one have them, too.
constexpr auto kStyles = std::to_array<StyleRow>({
    {"Button box", 36, 11, 0, 2, kButtonColor, makeStyled<MW::ButtonS, MW::ButtonS::kButtonBox>},
    {"Text box", 36, 11, 1, 2, kButtonColor, makeStyled<MW::ButtonS, MW::ButtonS::kTextBox>},
    {"Box", 49, 11, 0, 3, kButtonColor, makeStyled<MW::ButtonNew, MW::ButtonNew::kButtonBox>},
    {"Text", 49, 11, 1, 3, kButtonColor, makeStyled<MW::ButtonNew, MW::ButtonNew::kTextBox>},
    {"Framed", 49, 11, 2, 3, kButtonColor, makeStyled<MW::ButtonNew, MW::ButtonNew::kFramed>},
    {"Both", 60, 20, 0, 1, kButtonColor, makeStyled<MW::ButtonS, MW::ButtonS::kPassOn>},
    {"One", 72, 8, 1, 3, MW::kColorWhite, makePlain},
});

/// Counts the clicks of each.
class StyleTest : public PageTest {
 public:
  StyleTest()
      : PageTest("Button styles",
                 "Every button counts its clicks;\na click on the lowest counts twice.") {}

  void enter() override {
    page.ask();
    placeAll(std::make_index_sequence<kStyles.size()>());
  }

  void leave() override {
    for (auto& button : buttons) button.reset();
    page.endAsking();
  }

 private:
  template <std::size_t... index>
  void placeAll(std::index_sequence<index...>) {
    (place(index, [](int) { Current<StyleTest>::get().count(index); }), ...);
  }

  void place(std::size_t index, void (*clicked)(int)) {
    const StyleRow& row = kStyles.at(index);
    const SKIA_Rect area =
        cellOf(rowOf(screenSize(), row.top, row.height, row.color), row.column, row.columns);
    buttons.at(index) = row.make(area, captionOf(row.name));
    buttons.at(index)->setBdColor(MW::kColorBlack);  // of the framed one
    buttons.at(index)->clickCallback = clicked;
    buttons.at(index)->setActive(1);
  }

  void count(std::size_t index) {
    ++counts.at(index);
    std::string words;
    for (std::size_t i = 0; i < counts.size(); ++i) {
      if (counts.at(i) == 0) continue;
      words.append(kStyles.at(i).name)
          .append(" ")
          .append(std::to_string(counts.at(i)))
          .append("  ");
    }
    page.say(words.c_str());
  }

  Current<StyleTest> current{this};
  std::array<int, kStyles.size()> counts = {};  // dispatch thread
  std::array<std::unique_ptr<MW::Widget>, kStyles.size()> buttons;
};

}  // namespace

std::unique_ptr<Test> makeStyles(const Context&) { return std::make_unique<StyleTest>(); }

}  // namespace factory_test
