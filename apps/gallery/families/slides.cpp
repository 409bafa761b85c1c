// Switches and sliders.
#include <MW/primitives.h>
#include <MW/slide.h>
#include <MW/slide_e.h>
#include <MW/slide_move.h>

#include <array>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

constexpr auto kSlides = std::to_array<Example>({
    {"slide", "Slide", "A switch of two positions, whose knob a finger drags to the other end.",
     kThird,
     [](Loop& loop) {
       const SKIA_Rect upper = place(10, 4, 80, 9);
       const SKIA_Rect lower = place(10, 20, 80, 9);
       const SKIA_Text caption = words("Torch");
       MW::Slide atLeft(MW::Slide::kFullLeft, &upper, &caption, nullptr);
       MW::Slide atRight(MW::Slide::kFullRight, &lower, &caption, nullptr);
       for (MW::Slide* const slide : {&atLeft, &atRight}) {
         slide->leftCallback = [](int) { say("Left"); };
         slide->rightCallback = [](int) { say("Right"); };
         slide->setActive(1);
       }
       loop();
     }},
    {"slide_two_captions", "Slide with two captions",
     "It changes when the knob has come near the other end. The second caption's `size` says how "
     "many of its bytes are shown, too.",
     kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(10, 3, 80, 9);
       const SKIA_Text name = words("Torch");
       const SKIA_Text state = words("hot");
       MW::Slide slide(MW::Slide::kHalfLeft, &area, &name, &state);
       slide.leftCallback = [](int) { say("Left"); };
       slide.rightCallback = [](int) { say("Right"); };
       slide.setActive(1);
       loop();
     }},
    {"slide_locked", "Slide, locked",
     "A locked switch shows its knob alone, dimmed, and does not move. A double tap is told.",
     kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(10, 3, 80, 9);
       const SKIA_Text caption = words("Torch");
       MW::Slide slide(MW::Slide::kFullLeft, &area, &caption, nullptr);
       slide.doubleClickCallback = [](MW::mouse_event*) { say("It stays locked"); };
       slide.Lock();
       slide.setActive(1);
       loop();
     }},
    {"slide_v", "SlideV", "A switch without legends; at the left its knob covers the whole area.",
     kThird,
     [](Loop& loop) {
       const SKIA_Rect upper = place(10, 4, 80, 9);
       const SKIA_Rect lower = place(10, 20, 80, 9);
       const SKIA_Text caption = words("Torch");
       MW::SlideV atLeft(MW::Slide::kFullLeft, &upper, &caption, nullptr);
       MW::SlideV atRight(MW::Slide::kFullRight, &lower, &caption, nullptr);
       for (MW::SlideV* const slide : {&atLeft, &atRight}) {
         slide->leftCallback = [](int) { say("Left"); };
         slide->rightCallback = [](int) { say("Right"); };
         slide->setActive(1);
       }
       loop();
     }},
    {"slide_e", "SlideE", "Asks to leave: the knob is dragged all the way to the other end.",
     kThird,
     [](Loop& loop) {
       const SKIA_Rect upper = place(10, 4, 80, 9);
       const SKIA_Rect lower = place(10, 20, 80, 9);
       const SKIA_Text right = words("slide to the right");
       const SKIA_Text left = words("slide to the left");
       MW::SlideE toRight(MW::SlideE::kFromLeft, &upper, &right, nullptr);
       MW::SlideE toLeft(MW::SlideE::kFromRight, &lower, &left, nullptr);
       for (MW::SlideE* const slide : {&toRight, &toLeft}) {
         slide->exitCallback = [](int) { say("Leave"); };
         slide->setActive(1);
       }
       loop();
     }},
    {"slide_move",
     "SlideMove",
     "Chooses a number: a wide knob with the value on it, or a narrow one without. It has no "
     "callback; the application asks `getValue()`.",
     {0, 42},
     [](Loop& loop) {
       const SKIA_Rect upper = place(10, 4, 80, 9);
       const SKIA_Rect lower = place(10, 20, 80, 9);
       MW::SlideMove wide(&upper, MW::SlideMove::kValueKnob, 0, 100, 65);
       MW::SlideMove narrow(&lower, 10, 0, 100, 30);
       wide.setActive(1);
       narrow.setActive(1);
       const SKIA_Rect below = place(10, 31, 80, 8);
       const SKIA_Text volume = words("", MW::kColorWhite);
       MW::Label shown(&below, &volume);
       loop([&] {
         shown.setText(("Volume " + std::to_string(wide.getValue())).c_str());
         shown.show();
       });
     }},
});

}  // namespace

Family slides() {
  return {"Switches and sliders", "What is dragged.", sourceOf("families/slides.cpp"), kSlides};
}

}  // namespace gallery
