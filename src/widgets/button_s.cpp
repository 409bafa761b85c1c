#include <MW/button_s.h>
#include <MW/event_service.h>

#include <array>

#include "core/class_log.h"
#include "core/geometry.h"
#include "core/life_guard.h"

namespace MW {

namespace {

constexpr int kButtonBox = 0;  // styles
constexpr int kFramed = 2;
constexpr int kPassOn = 2;  // a bit of the style
constexpr int kFrameWidth = 1;

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

StyledButton::StyledButton(const char* logWord, int style, const SKIA_Rect* area,
                           const SKIA_Text* caption)
    : PushButton(logWord, area, caption) {
  buttonType = style;
}

int StyledButton::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  drawFace(ticks);
  return 1;
}

bool StyledButton::drawFace(unsigned int ticks) {
  if (!delayedShow.draws(ticks)) return false;
  if (buttonType == kButtonBox) {
    skia_add_buttonbox_c(rect, text);
  } else {
    skia_add_textbox_c(rect, text);
  }
  return true;
}

void StyledButton::setBgColor(unsigned int color) { write(rect.color, color); }

void StyledButton::onPress(event_data* event) {
  if (event == nullptr) return;
  ClassLog(word).print(LogLevel::Debug, "pressed!!");
  holdBy(event);
}

void StyledButton::onPressLong(event_data*) {
  ClassLog(word).print(LogLevel::Debug, "long pressed!!");
  const LifeGuard self(this);
  longPressCallback(0);
  if (self.isAlive()) select = 0;
}

ButtonS::ButtonS(const SKIA_Rect* area, const SKIA_Text* caption)
    : StyledButton("BUTTONS", kButtonBox, area, caption) {
  enterWindow(0);
}

ButtonS::ButtonS(int style, const SKIA_Rect* area, const SKIA_Text* caption)
    : StyledButton("BUTTONS", style, area, caption) {
  enterWindow(1);
}

ButtonS::~ButtonS() { leaveLayers(); }

bool ButtonS::onRecvEvent(event_data* event, unsigned int) {
  if (!isReachedBy(event)) return false;
  const bool isPassedOn = (buttonType & kPassOn) != 0;
  if (event->type != kEventMotion) return handleGesture(event) && !isPassedOn;
  if (select == 0) return false;
  if (isPassedOn) onGetOutOfArea(event);
  return !isPassedOn;
}

void ButtonS::onRelease(event_data* event) {
  ClassLog(word).print(LogLevel::Debug, "released!!");
  select = 0;
  clickAt(event);
}

void ButtonS::onGetOutOfArea(event_data* event) {
  const SKIA_Rect area = read(rect);
  if (EventService::isMouseEventForMe(&area, event)) return;
  if (!EventService::isMouseEventAroundMe(&area, event)) return;
  const ClassLog log(word);
  select = 0;
  clickCallback(0);
  log.print(LogLevel::Debug, "out of area!!");
}

ButtonNew::ButtonNew(int style, const SKIA_Rect* area, const SKIA_Text* caption)
    : StyledButton("BUTTONNEW", style, area, caption) {
  point.width = kFrameWidth;
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
  select = 0;
  clickAt(event);
  log.print(LogLevel::Debug, "released!!");
}

void ButtonNew::setBdColor(unsigned int color) { write(point.color, color); }
void ButtonNew::setBdWidth(int pixels) { write(point.width, pixels); }

}  // namespace MW
