#include <MW/screen.h>

#include <climits>

#include "support/drawings.h"
#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using FullScreenTest = WidgetTest;
using ScreenPlays = PlayTest;
using MW::Screen;

const Maker kScreen = makes<Screen>();  // 1440 x 2560
Step passOn() { return call(&MW::Widget::setButtonType, Screen::kPassOn); }

const std::vector<Play> kPlays = {
    {"TellsEveryTouch",
     kScreen,
     {finger(2), press(-5, 9000), moveTo(1, 2), longPress(3, 4), finger(7), release(5, 6)},
     "press+ hover+ long+ click+"},
    {"LeavesKeysAlone", kScreen, {keyDown(5), keyUp(5), plug(17), appEvent(1)}, "- - - -"},
    {"PassesTouchesOn",
     kScreen,
     {passOn(), press(1, 1), moveTo(2, 2), longPress(), release()},
     "press- hover- long- click-"},
    {"ATapThatReachesItTwiceIsADoubleTap",
     kScreen,
     {passOn(), press(500, 500), release(), release()},
     "press- click- click double-"},
    {"TapsOfADoubleTapMayLieApart",
     kScreen,
     {press(500, 500), release(), press(60, 2500), release(), press(), release(), lookAtLog()},
     "press+ click+ press+ click double+ press+ click+ <[BUTTON] onTouchClickCount!! 3>"},
    {"ALateTapStartsAnew",
     kScreen,
     {press(500, 500), release(), press(), later(500), release(), press(), release(), press(),
      release()},
     "press+ click+ press+ click+ press+ click+ press+ click double+"},
    {"EndsATapWithinItsSquare",
     kScreen,
     {press(500, 500), release(475, 524), press(), release()},
     "press+ click+ press+ click double+"},
    {"CountsNoTapThatEndsLeftOfItsSquare",
     kScreen,
     {press(500, 500), release(474, 500), press(), release()},
     "press+ click+ press+ click+"},
    {"CountsNoTapThatEndsBelowItsSquare",
     kScreen,
     {press(500, 500), release(500, 525), press(), release()},
     "press+ click+ press+ click+"},
    {"CountsTapsFiftyPixelsFromTheEdges",
     kScreen,
     {press(50, 50), release(), press(1390, 2510), release()},
     "press+ click+ press+ click double+"},
    {"CountsNoTapNearTheLeftEdge",
     kScreen,
     {press(49, 50), release(), press(), release()},
     "press+ click+ press+ click+"},
    {"CountsNoTapNearTheTopEdge",
     kScreen,
     {press(50, 49), release(), press(), release()},
     "press+ click+ press+ click+"},
    {"CountsNoTapNearTheRightEdge",
     kScreen,
     {press(1391, 2510), release(), press(), release()},
     "press+ click+ press+ click+"},
    {"HidingLeavesItHeld",
     kScreen,
     {finger(2), press(500, 500), call(&MW::Widget::hide), look(&MW::Widget::isActive),
      lookAtHold()},
     "press+ <0> <held 3>"},
};
TEST_P(ScreenPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, ScreenPlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(FullScreenTest, IsGreyBehindFourColors) {
  MW::FullScreen fill(MW::FullScreen::kBlue);
  EXPECT_EQ(shown(fill).front().rect, (SKIA_Rect{0, 0, 1441, 2561, MW::kColorBlue}));
  for (const int number : {static_cast<int>(MW::FullScreen::kGrey), -1, INT_MIN}) {
    fill.setRect(number);
    EXPECT_EQ(shown(fill).front().rect.color, MW::kColorGrey);
  }
}

}  // namespace
