#include <MW/dialog_select.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::DialogSelect;

std::unique_ptr<MW::Widget> choices() {
  auto made = makesOwn<DialogSelect>(9U)();
  auto& select = static_cast<DialogSelect&>(*made);
  select.setText_str(6, "no such choice");
  select.choiceCallback = [](MW::mouse_event* mouse) {
    noteTouch("choice" + std::to_string(mouse->state), mouse);
  };
  return made;
}
Step select(int value) { return call(&MW::Widget::setSelect, value); }

const PlaysOn kChoices = {choices};
const PlayTests kPlays = {
    kChoices("TheFirstChoiceAnswers",
             {press(288, 624), lookAtHold(), lookAtFaces(), release(), lookAtLog(), lookAtFaces()},
             "touch+ <held 1> <lit 1> choice1 lift- <[BUTTON] onBtnReleased!! 0 > <lit 0>"),
    kChoices("TheLastChoiceAnswersAnyFinger",
             {finger(2), press(1151, 1935), moveTo(1150, 1934), release()},
             "touch+ hover+ choice6 lift-"),
    kChoices("SlidingOffGivesItUp",
             {press(288, 624), moveTo(576, 624), lookAtFaces(), release(288, 624)},
             "touch+ hover- <lit 0> lift-"),
    kChoices("AnotherChoiceDoesNotAnswer",
             {press(864, 624), release(288, 1136), lookAtFaces(), press(863, 624)},
             "touch+ lift- <lit 0> touch-"),
    kChoices("InTheDarkNothingAnswers", {lcdOn(0), press(288, 624), drag(1, 0), release()},
             "touch- hover- lift-"),
    kChoices(
        "ASelectionThatIsNoChoiceAnswersNothing",
        {select(INT_MIN), release(288, 624), select(INT_MIN), drag(1, 0), select(7), release()},
        "lift- hover- lift-"),
    kChoices("KeysAreToldAndTheHookKeyInItsVariant",
             {keyDown(5), keyUp(6), appEvent(1), plug(7), keyDown(323),
              call(&MW::Widget::setButtonType, DialogSelect::kHookVariant), keyDown(323)},
             "down5+ up6+ - plug7+ + hook+"),
};

}  // namespace
