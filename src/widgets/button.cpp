#include <MW/button.h>
#include <MW/c_api.h>
#include <MW/event_service.h>
#include <MW/window.h>
#include <brimol/input.h>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/life_guard.h"

namespace MW {

namespace {
constexpr ClassLog kLog("BUTTON");
constexpr int kBaseLayer = 1;
constexpr int kRedraw = 1;
constexpr int kDoubleClick = 2;
}  // namespace

Button::Button(const SKIA_Rect* area, const SKIA_Text* caption)
    : normalColor(area != nullptr ? area->color : 0) {
  type_ = kBaseLayer;
  rect.color = normalColor;
  Button::setRect(0, area);
  text = copyText(caption);
  Window::registerWidget(this);
}

Button::~Button() { leaveLayers(); }

int Button::show() { return show(0); }

int Button::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (delayedShow.draws(ticks)) skia_add_buttonbox_c(rect, text);
  return 1;
}

void Button::updateTimer(unsigned int ticks) {
  if (read(delayedShow).isDue(ticks)) isDisplayUpdate_c(1);
}

int Button::hide() {
  setActive(0);
  setFace(normalColor);
  return 1;
}

bool Button::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr || read(delayedShow).isPending()) return false;
  // A held button follows every finger, wherever it is.
  if (select == 0 && !isInside(event)) return false;
  switch (event->type) {
    case kEventMotion: return moveAcross(event);
    case kEventPress: onPress(event); return true;
    case kEventRelease: onRelease(event); return true;
    case kEventLongPress: onPressLong(event); return true;
    default: return false;
  }
}

bool Button::moveAcross(event_data* event) {
  if (select == 0) return false;
  // Still held outside, and not highlighted again when the finger comes back.
  if (!isInside(event)) setFace(normalColor);
  return true;
}

char* Button::getText() { return text.text; }
unsigned int Button::getBgColor() { return read(rect.color); }
unsigned int Button::getTextColor() { return read(text.color); }
int Button::getFontSize() { return read(text.size); }
SKIA_Rect* Button::getPositionAndSize() { return &rect; }
void Button::setFontSize(int pixels) { write(text.size, pixels); }

void Button::setText(const char* newText) {
  const std::lock_guard guard(stateLock);
  putText(text, boundedText(newText));
}

void Button::setTextColor(unsigned int color) { write(text.color, color); }

void Button::onShowTimer(int ms) {
  const unsigned int now = GetTicks();
  {
    const std::lock_guard guard(stateLock);
    delayedShow.start(now, static_cast<unsigned int>(ms));
  }
  setActive(1);
  EventService_AppEvent_c(kRedraw);
}

void Button::onPress(event_data* event) {
  if (event == nullptr) return;
  kLog.print(LogLevel::Debug, "pressed!!");
  setFace(kColorHighlight);
  select = static_cast<int>(event->mouse.finger + 1);
  const LifeGuard self(this);
  pressCallback(0);
  if (self.isAlive() && doubleClickCallback) clicks.press(GetTicks());
}

void Button::onRelease(event_data* event) {
  select = 0;
  setFace(normalColor);
  if (isInside(event)) {
    const LifeGuard self(this);
    clickCallback(0);
    if (self.isAlive() && doubleClickCallback && clicks.isRunning()) onTouchClickCount();
  }
  kLog.print(LogLevel::Debug, "released!!");
}

void Button::onPressLong(event_data*) {
  kLog.print(LogLevel::Debug, "long pressed!!");
  // Without a callback the button stays held, and its release is still a click.
  if (!longPressCallback) return;
  const LifeGuard self(this);
  longPressCallback(0);
  if (!self.isAlive()) return;
  select = 0;
  setFace(normalColor);
}

void Button::setRect(int, const SKIA_Rect* newRect) {
  if (newRect == nullptr) return;
  const std::lock_guard guard(stateLock);
  rect = {newRect->x, newRect->y, newRect->w, newRect->h, rect.color};
}

void Button::onTouchClickCount() {
  const int count = clicks.tap(GetTicks());
  if (count == 0) return;
  kLog.print(LogLevel::Debug, "onTouchClickCount!! %d", count);
  if (count == kDoubleClick) doubleClickCallback(0);
}

void Button::restoreColor() {
  if (getBgColor() == normalColor) return;
  setFace(normalColor);
  EventService_AppEvent_c(kRedraw);
}

bool Button::isInside(const event_data* event) const {
  const SKIA_Rect area = read(rect);
  return EventService::isMouseEventForMe(&area, event);
}

void Button::setFace(unsigned int color) { write(rect.color, color); }

}  // namespace MW
