// Widgets that are described as data.
#include <MW/dialog.h>
#include <MW/widget_list.h>
#include <MW/widget_rcui.h>
#include <MW/window.h>

#include <array>

#include "families/families.h"
#include "place.h"

namespace gallery {

namespace {

constexpr auto kDescriptors = std::to_array<Example>({
    {"widget_rcui", "WidgetRcui, widgets", "A descriptor says what is built, and where.", kHalf,
     [](Loop& loop) {
       const MW::ref_cb_t callbacks = {
           .cbClick = [](int) { say("Clicked"); },
           .cbTouchRelease = [](int) { say("Leave"); },
       };
       MW::ref_t button;
       button.kind = MW::kRcuiButton;
       button.visible = 1;
       button.cbIndex = 1;
       button.rect = place(15, 4, 70, 9);
       button.text = words("A button");
       MW::ref_t slide = button;
       slide.kind = MW::kRcuiSlideFromLeft;
       slide.rect = place(15, 20, 70, 9);
       slide.text = words("a slide");
       MW::ref_t other = slide;
       other.kind = MW::kRcuiSlideFromRight;
       other.rect = place(15, 36, 70, 9);
       const MW::WidgetRcui first(&button, &callbacks, MW::kUnused);
       const MW::WidgetRcui second(&slide, &callbacks, MW::kUnused);
       const MW::WidgetRcui third(&other, &callbacks, MW::kUnused);
       loop();
     }},
    {"widget_rcui_items", "WidgetRcui, display items",
     "Items go to the display-item table. A column's boxes stand one below the other, wherever "
     "their own rectangles are.",
     kHalf,
     [](Loop& loop) {
       MW::WidgetList::init();
       MW::ref_t item;
       item.visible = 1;
       item.rect = place(15, 4, 70, 8, kDeep);
       for (const MW::RcuiKind kind :
            {MW::kRcuiFirstInColumn, MW::kRcuiNextInColumn, MW::kRcuiNextInColumn}) {
         item.kind = kind;
         item.text = words("Below the last one", MW::kColorWhite);
         const MW::WidgetRcui built(&item, nullptr, MW::kUnused);
         MW::WidgetList::show(item.index);
       }
       item.kind = MW::kRcuiTextbox;
       item.rect = place(15, 36, 70, 8, 0xFFD07030);
       item.text = words("By itself");
       const MW::WidgetRcui built(&item, nullptr, MW::kUnused);
       MW::WidgetList::show(item.index);
       loop([] { MW::WidgetList::show(); });
       MW::WidgetList::destroy();
     }},
    {"widget_rcui_dialog", "WidgetRcui, a dialog", "The five texts of `desc`: lines and captions.",
     kMiddle,
     [](Loop& loop) {
       const std::array<SKIA_Text, 5> texts = {words("from a descriptor"), words("in two lines"),
                                               words(""), words("NO"), words("YES")};
       MW::ref_t dialog;
       dialog.kind = MW::kRcuiDialogNew;
       dialog.visible = 1;
       dialog.text = words("A dialog", MW::kColorHighlight);
       dialog.desc = texts.data();
       const MW::WidgetRcui built(&dialog, nullptr, MW::kUnused);
       loop();
     },
     MW::kTopLayer},
});

}  // namespace

Family descriptors() {
  return {"Descriptors", "Screens described as data: `WidgetRcui` builds what `ref_t` says.",
          sourceOf("families/descriptors.cpp"), kDescriptors};
}

}  // namespace gallery
