#include <MW/button_new.h>

#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ButtonNewTest = WidgetTest;
using MW::ButtonNew;

constexpr SKIA_Rect kArea = {10, 20, 100, 50, 5};
const SKIA_Text* const kNoText = nullptr;

const PlaysOn kButton = {makes<ButtonNew, Told::Zero>(ButtonNew::kTextBox, &kArea, kNoText)};
const Play kPlay = kButton("",
                           {press(109, 69), moveTo(9, 9), look(&MW::Widget::getBgColor),
                            longPress(), lookAtHold(), release(), release(50, 40), lookAtLog()},
                           "press+ - <5> long+ <held 0> - click+ <[BUTTONNEW] released!!>");

TEST_F(ButtonNewTest, TakesNoMotionAndIsClickedAfterALongPress) { expectJournal(kPlay); }

TEST_F(ButtonNewTest, OnlyTheFramedStyleHasAFrame) {
  const std::vector<std::pair<int, std::size_t>> drawings = {
      {ButtonNew::kButtonBox, 1}, {ButtonNew::kTextBox, 1}, {ButtonNew::kFramed, 5}, {3, 1}};
  for (const auto& [style, count] : drawings) {
    ButtonNew button(style, &kArea, nullptr);
    EXPECT_EQ(shown(button).size(), count) << style;
  }
}

}  // namespace
