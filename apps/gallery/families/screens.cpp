// What covers the screen, and what takes input without being seen.
#include <MW/auto_cap_screen.h>
#include <MW/dialog_warn.h>
#include <MW/key.h>
#include <MW/primitives.h>
#include <MW/screen.h>

#include <array>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

constexpr auto kScreens = std::to_array<Example>({
    {"full_screen", "FullScreen", "The screen in one colour, to look for faults of the display.",
     kThird,
     [](Loop& loop) {
       MW::FullScreen red(MW::FullScreen::kRed);
       red.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"dialog_warn",
     "DialogWarn",
     "A warning in a colour of the application's choice, with up to four text boxes.",
     {25, 60},
     [](Loop& loop) {
       constexpr uint32_t kAlarm = 0xFFC02020;
       MW::DialogWarn warning(kAlarm);
       warning.setText(0, place(10, 30, 80, 10, kAlarm), words("Warning", MW::kColorWhite));
       warning.setText(1, place(10, 42, 80, 10, MW::kColorWhite), words("Do not switch off"));
       warning.touchReleaseCallback = [](MW::mouse_event*) { say("Touched"); };
       warning.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"auto_cap_screen",
     "AutoCapScreen",
     "A page whose colour and texts a test changes while it runs. It is transparent until it gets "
     "a colour.",
     {25, 60},
     [](Loop& loop) {
       MW::AutoCapScreen page(MW::kUnused);
       page.setBgColor(0xFF205080);
       page.setText(0, place(10, 30, 80, 10, 0xFF205080), words("Capacitance", MW::kColorWhite));
       page.setText(1, place(10, 42, 80, 10, MW::kColorWhite), words("0 of 64 lines"));
       page.setText_str(1, "17 of 64 lines");
       page.setActive(1);
       loop();
     },
     MW::kTopLayer},
    {"screen", "Screen",
     "Catches every touch, wherever it is, and draws nothing: here the application draws.", kThird,
     [](Loop& loop) {
       MW::Screen screen;
       screen.pressCallback = [](MW::mouse_event* mouse) {
         say("Touched at " + std::to_string(mouse->x) + ", " + std::to_string(mouse->y));
       };
       screen.doubleClickCallback = [](int) { say("A double tap"); };
       screen.setActive(1);
       const SKIA_Rect area = place(5, 12, 90, 10);
       const SKIA_Text hint = words("Touch me anywhere", MW::kColorWhite);
       MW::Label label(&area, &hint);
       loop([&] { label.show(); });
     }},
    {"key", "Key", "Tells keys, touches and plugs, and draws nothing.", kThird,
     [](Loop& loop) {
       MW::Key key;
       key.keyPressCallback = [](MW::kbd_event* event) { say("Key", event->code); };
       key.doubleKeyCallback = [](MW::kbd_event*) { say("Twice"); };
       const SKIA_Rect area = place(5, 12, 90, 10);
       const SKIA_Text hint = words("Press the volume keys", MW::kColorWhite);
       MW::Label label(&area, &hint);
       loop([&] { label.show(); });
     }},
});

}  // namespace

Family screens() {
  return {"Whole screens", "What covers the screen, and what takes input without being seen.",
          sourceOf("families/screens.cpp"), kScreens};
}

}  // namespace gallery
