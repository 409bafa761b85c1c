// Buttons.
#include <MW/button.h>
#include <MW/button3.h>
#include <MW/button8.h>
#include <MW/button_new.h>
#include <MW/button_s.h>
#include <MW/window.h>

#include <array>
#include <bitset>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

constexpr auto kButtons = std::to_array<Example>({
    {"button", "Button",
     "A push button. It is blue while a finger holds it, and tells a click when the finger lifts.",
     kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(15, 3, 70, 9);
       const SKIA_Text caption = words("Start");
       MW::Button button(&area, &caption);
       button.clickCallback = [](int) { say("Started"); };
       button.setActive(1);
       loop();
     }},
    {"button_later", "Button, after a while",
     "It takes touches and is drawn from the time on that it is given.", kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(15, 3, 70, 9);
       const SKIA_Text caption = words("Ready after a second");
       MW::Button button(&area, &caption);
       button.clickCallback = [](int) { say("Clicked"); };
       button.onShowTimer(1000);
       loop();
     },
     MW::kBaseLayer, 1500},
    {"button3",
     "Button3",
     "The large squares at the foot of a test. A position places them, not coordinates; there are "
     "three rows of them.",
     {60, 85},
     [](Loop& loop) {
       const SKIA_Text passed = words("PASS", 0xFF107010);
       const SKIA_Text again = words("RETRY");
       const SKIA_Text failed = words("FAIL", MW::kColorRed);
       const SKIA_Text reason = words("too dark", MW::kColorRed);
       const int free = MW::Window::height / 5;  // below the row
       MW::Button3 left(MW::Button3::kBottomLeft, &passed, free);
       MW::Button3 middle(MW::Button3::kBottomCentre, &again, free);
       MW::Button3 right(MW::Button3::kBottomRight, &failed, &reason, free);
       left.clickCallback = [](int) { say("Passed"); };
       middle.clickCallback = [](int) { say("Once more"); };
       right.clickCallback = [](int) { say("Failed"); };
       for (MW::Button3* const button : {&left, &middle, &right}) button->setActive(1);
       loop();
     }},
    {"button_s", "ButtonS",
     "A push button that keeps its colour while it is held, as a button box and as a text box.",
     kStrip,
     [](Loop& loop) {
       const SKIA_Rect left = place(5, 3, 43, 9);
       const SKIA_Rect right = place(52, 3, 43, 9);
       const SKIA_Text raised = words("Button box");
       const SKIA_Text flat = words("Text box");
       MW::ButtonS first(MW::ButtonS::kButtonBox, &left, &raised);
       MW::ButtonS second(MW::ButtonS::kTextBox, &right, &flat);
       first.clickCallback = [](int) { say("The left one"); };
       second.clickCallback = [](int) { say("The right one"); };
       first.setActive(1);
       second.setActive(1);
       loop();
     }},
    {"button_s_pass_on", "ButtonS that passes events on",
     "What lies below it is touched, too. Events come first to the widget that was made first, and "
     "the one that was made last is drawn above: the frame is made before the button in it.",
     kStrip,
     [](Loop& loop) {
       const SKIA_Rect around = place(5, 2, 90, 11, kDeep);
       const SKIA_Rect inside = place(30, 4, 40, 7);
       const SKIA_Text none = {};
       const SKIA_Text caption = words("Both");
       MW::ButtonS frame(MW::ButtonS::kPassOn, &around, &none);
       MW::Button button(&inside, &caption);
       frame.clickCallback = [](int) { say("The frame"); };
       button.clickCallback = [](int) { say("The frame and the button"); };
       frame.setActive(1);
       button.setActive(1);
       loop();
     }},
    {"button_new", "ButtonNew",
     "A push button that keeps its colour while it is held, here with a frame around it.", kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(15, 3, 70, 9);
       const SKIA_Text caption = words("Framed");
       MW::ButtonNew button(MW::ButtonNew::kFramed, &area, &caption);
       button.setBdColor(MW::kColorRed);
       button.setBdWidth(6);
       button.clickCallback = [](int) { say("Clicked"); };
       button.setActive(1);
       loop();
     }},
    {"button8", "Button8",
     "A pad for the multi-touch test: each cell can be held by another finger, and is red then.",
     kHalf,
     [](Loop& loop) {
       const SKIA_Rect area = place(15, 3, 70, 44);
       MW::Button8 pad(MW::Button8::kFourByTwo, &area, nullptr);
       const auto tell = [](MW::mouse_event* mouse) {
         const std::bitset<MW::Button8::kCells> held(mouse->state);
         say("Held cells:", static_cast<int64_t>(held.count()));
       };
       pad.pressCallback = tell;
       pad.clickCallback = tell;
       pad.setActive(1);
       loop();
     }},
});

}  // namespace

Family buttons() {
  return {"Buttons", "What is pressed. Callbacks come on the dispatch thread.",
          sourceOf("families/buttons.cpp"), kButtons};
}

}  // namespace gallery
