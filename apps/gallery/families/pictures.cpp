// Drawing elements.
#include <MW/primitives.h>
#include <MW/widget_list.h>

#include <array>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

constexpr auto kPictures = std::to_array<Example>({
    {"label", "Label", "A text without a background, in any script, with any of three alignments.",
     kThird,
     [](Loop& loop) {
       const SKIA_Rect first = place(5, 2, 90, 8);
       const SKIA_Rect second = place(5, 13, 90, 8);
       const SKIA_Rect third = place(5, 24, 90, 8);
       const SKIA_Text toLeft = words("To the left", MW::kColorWhite, SKIA_ALIGN_LEFT);
       const SKIA_Text inCentre = words("Déjà vu 한국어", 0xFFFFD060, SKIA_ALIGN_CENTRE);
       const SKIA_Text toRight = words("שלום to the right", MW::kColorWhite, SKIA_ALIGN_RIGHT);
       MW::Label one(&first, &toLeft);
       MW::Label two(&second, &inCentre);
       MW::Label three(&third, &toRight);
       loop([&] {
         one.show();
         two.show();
         three.show();
       });
     }},
    {"textbox", "Textbox", "A text on a filled rectangle.", kStrip,
     [](Loop& loop) {
       const SKIA_Rect area = place(15, 3, 70, 9, kDeep);
       const SKIA_Text text = words("Battery 87 %", MW::kColorWhite);
       MW::Textbox box(&area, &text);
       loop([&] { box.show(); });
     }},
    {"box", "Box", "A filled rectangle; the colour may let through what lies below it.", kThird,
     [](Loop& loop) {
       const SKIA_Rect behind = place(10, 4, 50, 18, 0xFFD07030);
       const SKIA_Rect front = place(40, 12, 50, 18, 0xA03070D0);
       MW::Box orange(&behind);
       MW::Box blue(&front);
       loop([&] {
         orange.show();
         blue.show();
       });
     }},
    {"line", "Line", "A straight line of any width.", kThird,
     [](Loop& loop) {
       const SKIA_Rect area = place(10, 4, 80, 26);
       const SKIA_Point falling = {area.x,          area.y,  // from
                                   area.x + area.w, area.y + area.h, MW::kColorGreen, 6};
       const SKIA_Point rising = {area.x,          area.y + area.h,  // from
                                  area.x + area.w, area.y,          MW::kColorWhite, 2};
       MW::Line down(&falling);
       MW::Line up(&rising);
       loop([&] {
         down.show();
         up.show();
       });
     }},
    {"image", "Image",
     "A picture file. It is drawn by way of the display-item table; where there is no such file, "
     "its place stays empty.",
     kHalf,
     [](Loop& loop) {
       const SKIA_Rect area = place(20, 3, 60, 44);
       const SKIA_Text file = words(pictureFile("test_card.png"));
       MW::WidgetList::init();
       MW::WidgetList::show(MW::Image(&area, &file).add_MWWList());
       loop([] { MW::WidgetList::show(); });
       MW::WidgetList::destroy();
     }},
    {"widget_list", "WidgetList",
     "The display-item table draws still pictures without a widget for each. Items are changed by "
     "the index that they got.",
     kThird,
     [](Loop& loop) {
       const SKIA_Rect left = place(5, 5, 43, 22, 0xFFD07030);
       const SKIA_Rect right = place(52, 5, 43, 22, 0xFF3070D0);
       const SKIA_Text text = words("Item", MW::kColorWhite);
       MW::WidgetList::init();
       const int box = MW::WidgetList::addQueue(SKIA_ROUNDBOX, &left, nullptr, nullptr);
       const int label = MW::WidgetList::addQueue(SKIA_ROUNDTEXTBOX, &right, nullptr, &text);
       MW::WidgetList::show(box);
       MW::WidgetList::show(label);
       MW::WidgetList::setText(label, "Changed", 7);
       loop([] { MW::WidgetList::show(); });
       MW::WidgetList::destroy();
     }},
});

}  // namespace

Family pictures() {
  return {"Drawing elements",
          "They are in no layer and get no events: the application shows them in each frame.",
          sourceOf("families/pictures.cpp"), kPictures};
}

}  // namespace gallery
