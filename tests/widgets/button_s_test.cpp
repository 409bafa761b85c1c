#include <MW/button_s.h>

#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ButtonSPlays = PlayTest;
using MW::ButtonS;

constexpr SKIA_Rect kArea = {10, 20, 100, 50, 5};
const SKIA_Rect* const kNoRect = nullptr;
const SKIA_Text* const kNoText = nullptr;

Maker styled(int style) { return makes<ButtonS, Told::Zero>(style, &kArea, kNoText); }
Step color() { return look(&MW::Widget::getBgColor); }

const std::vector<Play> kPlays = {
    {"TakesItsEvents",
     styled(4),
     {finger(2), press(10, 20), color(), moveTo(112, 20), release(), color(), lookAtLog()},
     "press+ <5> + + <5> <[BUTTONS] released!!>"},
    {"PassesItsEventsOn",
     styled(ButtonS::kPassOn),
     {press(50, 40), moveTo(60, 40), longPress(), color(), release(), lookAtLog()},
     "press- - long- <5> click- <[BUTTONS] onTouchClickCount!! 1>"},
    {"IsDoubleClickedByAReleaseThatReachesItTwice",
     styled(ButtonS::kPassOn),
     {press(50, 40), release(), release()},
     "press- click- click double-"},
    {"IsClickedByAFingerThatSlidesOff",
     styled(7),
     {press(50, 40), moveTo(130, 40), lookAtHold(), moveTo(129, 69), lookAtHold(), lookAtLog(),
      moveTo(120, 40), release()},
     "press- - <held 1> click- <held 0> <[BUTTONS] out of area!!> - -"},
    {"IsReleasedByALongPressWithoutACallback",
     without(&MW::Widget::longPressCallback, styled(ButtonS::kButtonBox)),
     {press(50, 40), longPress(), lookAtHold(), release()},
     "press+ + <held 0> click+"},
    {"StartsAsAButtonBox",
     makes<ButtonS, Told::Zero>(kNoRect, kNoText),
     {look(&MW::Widget::typeButton), look([](MW::Widget& button) {
        return shown(button).at(0).call == Call::ButtonBox ? "button box" : "text box";
      })},
     "<0> <button box>"},
};
TEST_P(ButtonSPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, ButtonSPlays, testing::ValuesIn(kPlays), kRowName);

}  // namespace
