// Dialogs whose words the application gives.
#include <MW/dialog_list.h>
#include <MW/dialog_new.h>
#include <MW/dialog_select.h>
#include <MW/dialog_shell.h>
#include <MW/dialog_slide.h>

#include <array>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

// NOLINTBEGIN(readability-non-const-parameter): the list calls its callbacks with an int*
constexpr auto kDialogs = std::to_array<Example>({
    {"dialog_new", "DialogNew", "Any title, up to three lines, and up to two buttons.", kMiddle,
     [](Loop& loop) {
       MW::DialogNew dialog("Sensor", SKIA_ALIGN_CENTRE, static_cast<int>(MW::kColorHighlight));
       dialog.setDesc("Cover the sensor", "with a finger", "and look at it");
       dialog.setbutton("FAIL", "PASS");
       dialog.button1Callback = [](int) { say("Failed"); };
       dialog.button2Callback = [](int) { say("Passed"); };
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"dialog_new_one_button", "DialogNew with one button", "The letters of one line are larger.",
     kMiddle,
     [](Loop& loop) {
       MW::DialogNew dialog("Sensor", SKIA_ALIGN_CENTRE, static_cast<int>(MW::kColorHighlight));
       dialog.setDesc("The sensor works.", nullptr, nullptr, SKIA_ALIGN_CENTRE);
       dialog.setbutton("OK", nullptr);
       dialog.button1Callback = [](int) { say("Confirmed"); };
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"dialog_new_lines", "DialogNew without buttons", "The application hides it.", kMiddle,
     [](Loop& loop) {
       MW::DialogNew dialog("Sensor", SKIA_ALIGN_CENTRE, static_cast<int>(MW::kColorHighlight));
       dialog.setDesc("Cover the sensor", "with a finger", nullptr);
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"dialog_new_progress", "DialogNew with a progress row", "", kMiddle,
     [](Loop& loop) {
       MW::DialogNew dialog("Sensor", SKIA_ALIGN_CENTRE, static_cast<int>(MW::kColorHighlight));
       dialog.setDesc("The sensor is calibrated", "Do not move the phone", nullptr);
       dialog.setProgress(MW::kUnused);
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer, 600},
    {"dialog_list",
     "DialogList",
     "One of two to eight rows.",
     {27, 73},
     [](Loop& loop) {
       MW::DialogList dialog("Which lens?");
       for (const char* const lens : {"Main", "Wide", "Tele", "Front"}) dialog.addIndex(lens);
       dialog.initFinish(1);
       dialog.button1Callback = [](int*) { say("Cancelled"); };
       dialog.button2Callback = [](int* row) { say("Row", *row); };
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"dialog_select",
     "DialogSelect",
     "One of six.",
     {8, 92},
     [](Loop& loop) {
       MW::DialogSelect dialog(MW::kUnused);
       dialog.setTitle("Which radio?");
       unsigned int choice = 0;
       for (const char* const name : {"2G", "3G", "4G", "5G", "BT", "NFC"}) {
         dialog.setText_str(choice++, name);
       }
       dialog.choiceCallback = [](MW::mouse_event* mouse) { say("Choice", mouse->state); };
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"dialog_shell",
     "DialogShell",
     "A console of up to 25 lines; the oldest goes.",
     {20, 80},
     [](Loop& loop) {
       MW::DialogShell dialog("ls /proc/sys");
       for (const char* const line : {"abi", "debug", "dev", "fs", "kernel", "net", "user", "vm"}) {
         dialog.addShell(line);
       }
       dialog.button1Callback = [](int) { say("Confirmed"); };
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"dialog_slide", "DialogSlide",
     "Answered by dragging. Its one built-in kind asks whether a passed test is to be repeated.",
     kMiddle,
     [](Loop& loop) {
       MW::DialogSlide dialog(MW::DialogSlide::kRepeatPassedTest);
       dialog.leftCallback = [](int) { say("Left"); };
       dialog.rightCallback = [](int) { say("Right"); };
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"dialog_slide_own", "DialogSlide with words of the application", "", kMiddle,
     [](Loop& loop) {
       MW::DialogSlide dialog(MW::DialogSlide::kOwnTexts);
       dialog.setTitle("Torch");
       dialog.setDesc("Is the torch bright?");
       dialog.setLeft("DARK");
       dialog.setRight("BRIGHT");
       dialog.setSlide("DRAG", 0);
       dialog.leftCallback = [](int) { say("Dark"); };
       dialog.rightCallback = [](int) { say("Bright"); };
       dialog.setActive(1);
       loop();
     },
     MW::kTopLayer},
});
// NOLINTEND(readability-non-const-parameter)

}  // namespace

Family dialogs() {
  return {"Dialogs", "They stand in the top layer: while one is active, nothing below gets events.",
          sourceOf("families/dialogs.cpp"), kDialogs};
}

}  // namespace gallery
