// The touches and keys of a frame with two buttons, played on a built-in dialog that has them.

#include <MW/dialog.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

std::unique_ptr<MW::Widget> prompt() {
  auto made = makes<MW::Dialog>(MW::Dialog::kLeaveFailedTest)();
  made->button2Callback = [](int) { note(stage.widget->isActive() ? "too early" : "button2"); };
  return made;
}

const PlaysOn kPrompt = {prompt};
const auto kPlays = std::to_array<Play>({
    kPrompt(
        "TheLeftButtonAnswersAndStaysUp",
        {finger(2), press(154, 1400), lookAtHold(), lookAtFaces(), release(714, 1619), lookAtLog()},
        "press+ <held 3> <lit 1> button1 click+ <[DIALOG] btn1 released!!>"),
    kPrompt("TheRightButtonHidesFirst",
            {press(1285, 1619), release(), lookAtFaces(), lookAtLog(), lookAtHold()},
            "press+ button2 click+ <lit 0> <[DIALOG] btn2 released!!> <held 0>"),
    kPrompt("BesideTheButtonsNothingAnswers",
            {moveTo(300, 1500), press(720, 1500), release(), longPress(300, 1500), appEvent(1)},
            "hover- press- click+ - -"),
    kPrompt("AFingerThatSlidesOffTakesTheHighlightAlong",
            {press(300, 1500), moveTo(301, 1500), lookAtFaces(), moveTo(720, 1500), lookAtFaces(),
             release(), release(300, 1500)},
            "press+ hover+ <lit 1> hover+ <lit 0> click+ button1 click+"),
    kPrompt("InTheDarkNothingAnswersUntilItIsHidden",
            {press(300, 1500), lcdOn(0), moveTo(720, 1500), lookAtFaces(), press(300, 1500),
             release(), hide(), press()},
            "press+ hover+ <lit 0> press- click+ press+"),
    kPrompt("KeysAreTold", {keyDown(5), keyUp(6)}, "down5+ up6+"),
});

using FramedDialogPlays = PlayTest;
TEST_P(FramedDialogPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, FramedDialogPlays, testing::ValuesIn(kPlays), kRowName);

}  // namespace
