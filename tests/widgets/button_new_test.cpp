#include <MW/button_new.h>

#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ButtonNewTest = WidgetTest;
using ButtonNewPlays = PlayTest;
using MW::ButtonNew;

constexpr SKIA_Rect kArea = {10, 20, 100, 50, 5};
const SKIA_Text* const kNoText = nullptr;
const Maker kButton = makes<ButtonNew, Told::Zero>(ButtonNew::kButtonBox, &kArea, kNoText);

const std::vector<Play> kPlays = {
    {"TakesNoMotion",
     kButton,
     {press(109, 69), moveTo(9, 9), release(), lookAtLog(), look(&MW::Widget::getBgColor)},
     "press+ - + <[BUTTONNEW] released!!> <5>"},
    {"IsClickedByAReleaseAfterALongPress",
     kButton,
     {press(109, 69), longPress(9, 9), lookAtHold(), release(), release(50, 40)},
     "press+ long+ <held 0> - click+"},
    {"CountsClicks",
     kButton,
     {press(50, 40), release(), press(), release()},
     "press+ click+ press+ click double+"},
};
TEST_P(ButtonNewPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, ButtonNewPlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(ButtonNewTest, AFrameEndsBelowAndRightOfTheFace) {
  ButtonNew framed(ButtonNew::kFramed, &kArea, nullptr);
  framed.setBdColor(7);
  framed.setBdWidth(3);
  const std::vector<Drawing> drawn = shown(framed);
  ASSERT_EQ(drawn.size(), 5U);
  EXPECT_EQ(drawn.at(1).line, (SKIA_Point{10, 20, 110, 20, 7, 3}));
  EXPECT_EQ(drawn.at(2).line, (SKIA_Point{10, 70, 110, 70, 7, 3}));
  EXPECT_EQ(drawn.at(3).line, (SKIA_Point{10, 20, 10, 70, 7, 3}));
  EXPECT_EQ(drawn.at(4).line, (SKIA_Point{110, 20, 110, 70, 7, 3}));
}

TEST_F(ButtonNewTest, OnlyTheFramedStyleHasAFrame) {
  for (const int style : {0, 1, 3, -2}) {
    ButtonNew button(style, &kArea, nullptr);
    EXPECT_EQ(shown(button).size(), 1U) << style;
  }
}

}  // namespace
