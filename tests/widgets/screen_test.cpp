#include <MW/screen.h>

#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ScreenTest = WidgetTest;
using MW::Screen;

const PlaysOn kScreen = {makes<Screen>()};  // 1440 x 2560
Step passOn() { return call(&MW::Widget::setButtonType, Screen::kPassOn); }

const PlayTests kPlays = {
    kScreen("TellsEveryTouchAndLeavesKeysAlone",
            {finger(2), press(-5, 9000), moveTo(1, 2), longPress(3, 4), finger(7), release(5, 6),
             keyDown(5), keyUp(5), plug(17)},
            "press+ hover+ long+ click+ - - -"),
    kScreen("PassesTouchesOn", {passOn(), press(1, 1), moveTo(2, 2), longPress(), release()},
            "press- hover- long- click-"),
    kScreen("ATapThatReachesItTwiceIsADoubleTap", {passOn(), press(500, 500), release(), release()},
            "press- click- click double-"),
    kScreen("TapsOfADoubleTapMayLieApart",
            {press(50, 50), release(25, 74), press(1390, 2510), release(), press(), release(),
             lookAtLog()},
            "press+ click+ press+ click double+ press+ click+ <[BUTTON] onTouchClickCount!! 3>"),
    kScreen("AReleaseBesideTheSquareEndsTheTap",
            {passOn(), press(500, 500), release(600, 600), release(500, 500), press(), release()},
            "press- click- click- press- click-"),
    kScreen("HidingLeavesItHeld",
            {press(500, 500), call(&MW::Widget::hide), look(&MW::Widget::isActive), lookAtHold()},
            "press+ <0> <held 1>"),
};

// Near an edge of the screen, or released beside the square around the press.
TEST_F(ScreenTest, CountsNoTapBesideItsSquare) {
  for (const auto& [from, to] : {std::pair(Spot{49, 50}, Spot{49, 50}),
                                 {{50, 49}, {50, 49}},
                                 {{1391, 2510}, {1391, 2510}},
                                 {{1390, 2511}, {1390, 2511}},
                                 {{500, 500}, {474, 500}},
                                 {{500, 500}, {500, 525}}}) {
    const Steps steps = {press(700, 700), release(), press(from.x, from.y), release(to.x, to.y)};
    EXPECT_EQ(played(kScreen.make, steps), "press+ click+ press+ click+");
  }
}

}  // namespace
