// Push buttons without a highlight, in all their styles.
#include <MW/button.h>
#include <MW/button_new.h>
#include <MW/button_s.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <memory>
#include <string>
#include <utility>

#include "current.h"
#include "language/language.h"
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

// By the numbers of kStyles.
std::array<SKIA_Rect, 7> placesOf(const SKIA_Rect& content, int gap) {
  const auto [upper, middle, lower] = rowsOf<3>(content, gap, {1, 1, 2});
  const auto [box, text] = columnsOf<2>(upper, gap, {1, 1});
  const auto [newBox, newText, framed] = columnsOf<3>(middle, gap, {1, 1, 1});
  const SKIA_Rect inner = columnsOf<3>(rowsOf<3>(lower, 0, {6, 3, 1})[1], gap, {1, 1, 1})[1];
  return {box, text, newBox, newText, framed, lower, inner};
}

struct StyleRow {
  const char* name;
  uint32_t color;
  MakeButton make;
};

// Events come to the last but one first, and it lets the last one have them, too.
constexpr auto kStyles = std::to_array<StyleRow>({
    {msg("Button box"), kButtonInk.ground, makeStyled<MW::ButtonS, MW::ButtonS::kButtonBox>},
    {msg("Text box"), kButtonInk.ground, makeStyled<MW::ButtonS, MW::ButtonS::kTextBox>},
    {msg("Box"), kButtonInk.ground, makeStyled<MW::ButtonNew, MW::ButtonNew::kButtonBox>},
    {msg("Text"), kButtonInk.ground, makeStyled<MW::ButtonNew, MW::ButtonNew::kTextBox>},
    {msg("Framed"), kButtonInk.ground, makeStyled<MW::ButtonNew, MW::ButtonNew::kFramed>},
    {msg("Both"), kButtonInk.ground, makeStyled<MW::ButtonS, MW::ButtonS::kPassOn>},
    {msg("One"), MW::kColorWhite, makePlain},
});

/// Counts the clicks of each.
class StyleTest : public PageTest {
 public:
  StyleTest()
      : PageTest(tr("Button styles"),
                 tr("Every button counts its clicks;\na click on the lowest counts twice.")) {}

  void enter() override {
    page.ask();
    placeAll(std::make_index_sequence<kStyles.size()>());
  }

  bool isComplete() const override {
    return std::ranges::all_of(counts, [](const auto& count) { return count > 0; });
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
    const auto places = placesOf(contentArea(), gapOf(screenSize()));
    const SKIA_Rect area = inColor(places.at(index), row.color);
    buttons.at(index) = row.make(area, captionIn(area, tr(row.name), kButtonInk.text));
    buttons.at(index)->setBdColor(MW::kColorBlack);  // of the framed one
    buttons.at(index)->clickCallback = clicked;
    buttons.at(index)->setActive(1);
  }

  void count(std::size_t index) {
    ++counts.at(index);
    std::string words(tr(kStyles.at(index).name));
    words.append(" ").append(std::to_string(counts.at(index))).append(tr(", all:"));
    for (const auto& each : counts) words.append(" ").append(std::to_string(each));
    page.say(words.c_str());
  }

  Current<StyleTest> current{this};
  std::array<std::atomic<int>, kStyles.size()> counts = {};
  std::array<std::unique_ptr<MW::Widget>, kStyles.size()> buttons;
};

}  // namespace

std::unique_ptr<Test> makeStyles(const Context&) { return std::make_unique<StyleTest>(); }

}  // namespace factory_test
