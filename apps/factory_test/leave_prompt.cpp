#include "leave_prompt.h"

#include <MW/window.h>

#include "verdict_bar.h"

namespace factory_test {

LeavePrompt::LeavePrompt() : dialog(MW::Dialog::kLeaveTest) {
  using Prompt = Current<LeavePrompt>;
  dialog.setTitle("Leave");
  dialog.setDesc("End the factory test?");
  dialog.button1Callback = [](int) { Prompt::get().answer(Answer::Yes); };
  dialog.button2Callback = [](int) { Prompt::get().answer(Answer::No); };
  dialog.keyPressCallback = [](MW::kbd_event* event) {
    if (event->code == MW::kKeySelect) Prompt::get().answer(Answer::Yes);
    if (event->code == kKeyBack) Prompt::get().answer(Answer::No);
  };
  dialog.setActive(1);
  MW::isDisplayUpdate(1);
}

}  // namespace factory_test
