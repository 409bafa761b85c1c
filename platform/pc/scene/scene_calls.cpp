#include <brimol/frame.h>
#include <brimol/scene.h>

#include "scene/item.h"
#include "scene/recorder.h"

using brimol::pc::record;

void skia_begin_frame_c() { brimol::pc::beginRecording(); }
void skia_end_frame_c() { brimol::pc::endRecording(); }

int skia_add_box_c(SKIA_Rect rect) { return record({SKIA_BOX, rect, {}, {}}); }
int skia_add_roundbox_c(SKIA_Rect rect) { return record({SKIA_ROUNDBOX, rect, {}, {}}); }
int skia_add_line_c(SKIA_Point line) { return record({SKIA_LINE, {}, line, {}}); }

int skia_add_label_c(SKIA_Rect rect, SKIA_Text text) {
  return record({SKIA_LABEL, rect, {}, text});
}

int skia_add_textbox_c(SKIA_Rect rect, SKIA_Text text) {
  return record({SKIA_TEXTBOX, rect, {}, text});
}

int skia_add_roundtextbox_c(SKIA_Rect rect, SKIA_Text text) {
  return record({SKIA_ROUNDTEXTBOX, rect, {}, text});
}

int skia_add_buttonbox_c(SKIA_Rect rect, SKIA_Text text) {
  return record({SKIA_BUTTONBOX, rect, {}, text});
}

int skia_add_roundbuttonbox_c(SKIA_Rect rect, SKIA_Text text) {
  return record({SKIA_ROUNDBUTTONBOX, rect, {}, text});
}

int skia_add_staticbox_c(SKIA_Rect rect, SKIA_Text text) {
  return record({SKIA_STATICBOX, rect, {}, text});
}

int skia_add_arrow_c(SKIA_Rect rect, SKIA_Point direction) {
  return record({SKIA_ARROW, rect, direction, {}});
}

int skia_add_widget_c(const SKIA_Item* item) {
  if (item == nullptr || !brimol::pc::isKnownKind(item->kind)) return brimol::pc::kNotTaken;
  return record(*item);
}
