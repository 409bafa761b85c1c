#include <MW/button_new.h>
#include <MW/button_s.h>

#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ButtonNewTest = WidgetTest;
using MW::ButtonNew;
using MW::ButtonS;

constexpr SKIA_Rect kArea = {10, 20, 100, 50, 5};
const SKIA_Text* const kNoText = nullptr;
const PlaysOn kTaking = {makes<ButtonS, Told::Zero>(4, &kArea, kNoText)};
const PlaysOn kPassing = {makes<ButtonS, Told::Zero>(ButtonS::kPassOn, &kArea, kNoText)};
const PlaysOn kNew = {makes<ButtonNew, Told::Zero>(ButtonNew::kTextBox, &kArea, kNoText)};

const PlayTests kPlays = {
    kTaking("TakesItsEvents",
            {press(10, 20), look(&MW::Widget::getBgColor), moveTo(112, 20), lookAtHold(), release(),
             lookAtHold(), lookAtLog()},
            "press+ <5> + <held 1> + <held 0> <[BUTTONS] released!!>"),
    kPassing("PassesItsEventsOn", {press(50, 40), moveTo(60, 40), longPress(), release()},
             "press- - long- click-"),
    kPassing("IsDoubleClickedByAReleaseThatReachesItTwice",
             {press(50, 40), release(), lookAtLog(), release()},
             "press- click- <[BUTTONS] onTouchClickCount!! 1> click double-"),
    PlaysOn{makes<ButtonS, Told::Zero>(7, &kArea, kNoText)}(
        "IsClickedByAFingerThatSlidesOff",
        {press(50, 40), moveTo(130, 40), lookAtHold(), moveTo(129, 69), lookAtHold(), lookAtLog(),
         moveTo(120, 40), release()},
        "press- - <held 1> click- <held 0> <[BUTTONS] out of area!!> - -"),
    PlaysOn{without(&MW::Widget::longPressCallback, kTaking.make)}(
        "IsReleasedByALongPressWithoutACallback",
        {press(50, 40), longPress(), lookAtHold(), release()}, "press+ + <held 0> click+"),
    kNew("ANewOneTakesNoMotionAndIsClickedAfterALongPress",
         {press(109, 69), moveTo(9, 9), look(&MW::Widget::getBgColor), longPress(), lookAtHold(),
          release(), release(50, 40), lookAtLog()},
         "press+ - <5> long+ <held 0> - click+ <[BUTTONNEW] released!!>"),
};

TEST_F(ButtonNewTest, AStyleOfNoNameHasNoFrame) {
  ButtonNew framed(ButtonNew::kFramed, &kArea, nullptr);
  EXPECT_EQ(shown(framed).size(), 5U);
  framed.onShowTimer(100);
  EXPECT_TRUE(shown(framed).empty()) << "its frame waits with it";
  EXPECT_EQ(shown(*std::make_unique<ButtonNew>(3, &kArea, nullptr)).size(), 1U);
}

}  // namespace
