// What goes away by itself.
#include <MW/timed.h>

#include <array>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

constexpr auto kTimed = std::to_array<Example>({
    {"toastbox", "Toastbox", "A line of text that hides itself after a while.", kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(15, 3, 70, 9, kDeep);
       const SKIA_Text line = words("Saved", MW::kColorWhite);
       MW::Toastbox toast(&area, &line);
       toast.onHideTimer(3000);
       loop();
     }},
    {"toastbox_two_lines", "Toastbox with two lines", "", kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(15, 3, 70, 9, kDeep);
       const SKIA_Text line = words("Saved", MW::kColorWhite);
       const SKIA_Text detail = words("3 of 5 tests passed", 0xFFC0D0E0);
       MW::Toastbox toast(&area, &line, &detail);
       toast.onHideTimer(3000);
       loop();
     }},
    {"progressbar", "Progressbar",
     "A caption over a row of asterisks that grows while something goes on.", kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(15, 2, 70, 5, kDeep);
       const SKIA_Text caption = words("Copying", MW::kColorWhite);
       MW::Progressbar bar(MW::kUnused, &area, &caption);
       bar.onProgressbar(5000);
       loop();
     },
     MW::kBaseLayer, 800},
});

}  // namespace

Family timed() {
  return {"For a while", "What shows for a given time and takes no input.",
          sourceOf("families/timed.cpp"), kTimed};
}

}  // namespace gallery
