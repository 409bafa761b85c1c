#include <MW/button_new.h>

#include <array>

#include "core/class_log.h"
#include "core/geometry.h"

namespace MW {

namespace {

// The top, bottom, left and right edge, drawn with the pen.
constexpr std::array<SKIA_Point, 4> frameOf(const SKIA_Rect& area, const SKIA_Point& pen) {
  const int left = area.x;
  const int top = area.y;
  const int right = toPixels(int64_t{left} + area.w);
  const int bottom = toPixels(int64_t{top} + area.h);
  return {{{left, top, right, top, pen.color, pen.width},
           {left, bottom, right, bottom, pen.color, pen.width},
           {left, top, left, bottom, pen.color, pen.width},
           {right, top, right, bottom, pen.color, pen.width}}};
}
static_assert(frameOf({10, 20, 100, 50, 0}, {})[1].y1 == 70);
static_assert(frameOf({10, 20, 100, 50, 0}, {})[3].x1 == 110);

}  // namespace

ButtonNew::ButtonNew(int style, const SKIA_Rect* area, const SKIA_Text* caption)
    : StyledButton("BUTTONNEW", style, area, caption) {
  point.width = 1;  // pixel
  enterWindow(1);
}

ButtonNew::~ButtonNew() { leaveLayers(); }

int ButtonNew::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (!drawFace(ticks) || buttonType != kFramed) return 1;
  for (const SKIA_Point& edge : frameOf(rect, point)) skia_add_line_c(edge);
  return 1;
}

bool ButtonNew::onRecvEvent(event_data* event, unsigned int) {
  return isReachedBy(event) && handleGesture(event);
}

void ButtonNew::onRelease(event_data* event) {
  const ClassLog log(word);
  hold.letGo();
  clickAt(event);
  log.print(LogLevel::Debug, "released!!");
}

void ButtonNew::setBdColor(unsigned int color) { write(point.color, color); }
void ButtonNew::setBdWidth(int pixels) { write(point.width, pixels); }

}  // namespace MW
