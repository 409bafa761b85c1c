#include <MW/button_s.h>

#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ButtonSPlays = PlayTest;
using MW::ButtonS;

constexpr SKIA_Rect kArea = {10, 20, 100, 50, 5};
const SKIA_Text* const kNoText = nullptr;
const PlaysOn kTaking = {makes<ButtonS, Told::Zero>(4, &kArea, kNoText)};
const PlaysOn kNoLongPress = {without(&MW::Widget::longPressCallback, kTaking.make)};
const PlaysOn kPassing = {makes<ButtonS, Told::Zero>(ButtonS::kPassOn, &kArea, kNoText)};
const PlaysOn kBoth = {makes<ButtonS, Told::Zero>(7, &kArea, kNoText)};

const std::vector<Play> kPlays = {
    kTaking("TakesItsEvents",
            {press(10, 20), look(&MW::Widget::getBgColor), moveTo(112, 20), release(), lookAtLog()},
            "press+ <5> + + <[BUTTONS] released!!>"),
    kPassing("PassesItsEventsOn", {press(50, 40), moveTo(60, 40), longPress(), release()},
             "press- - long- click-"),
    kPassing("IsDoubleClickedByAReleaseThatReachesItTwice",
             {press(50, 40), release(), lookAtLog(), release()},
             "press- click- <[BUTTONS] onTouchClickCount!! 1> click double-"),
    kBoth("IsClickedByAFingerThatSlidesOff",
          {press(50, 40), moveTo(130, 40), lookAtHold(), moveTo(129, 69), lookAtHold(), lookAtLog(),
           moveTo(120, 40), release()},
          "press- - <held 1> click- <held 0> <[BUTTONS] out of area!!> - -"),
    kNoLongPress("IsReleasedByALongPressWithoutACallback",
                 {press(50, 40), longPress(), lookAtHold(), release()}, "press+ + <held 0> click+"),
};
TEST_P(ButtonSPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, ButtonSPlays, testing::ValuesIn(kPlays), kRowName);

}  // namespace
