#include <MW/c_api.h>
#include <MW/event_service.h>
#include <MW/ime.h>
#include <MW/static_text.h>
#include <brimol/input.h>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/life_guard.h"
#include "core/redraw.h"

namespace MW {

template <typename... Self>
TextPanel<Self...>::TextPanel(const char* logWord) : word(logWord) {
  type_ = kBaseLayer;
}

template <typename... Self>
void TextPanel<Self...>::takeLooks(const SKIA_Rect* area, const SKIA_Text* looks) {
  const SKIA_Rect place = area != nullptr ? *area : SKIA_Rect{};
  {
    const std::lock_guard guard(stateLock);
    rect.color = saved_bg_color = place.color;
    text = copyText(looks);
  }
  setRect(0, &place);
}

template <typename... Self>
int TextPanel<Self...>::show() {
  return show(0);
}

// The time is never taken back, so that every pass behind it asks: meant so.
template <typename... Self>
void TextPanel<Self...>::updateTimer(unsigned int ticks) {
  if (read(showTimer).isDue(ticks)) isDisplayUpdate_c(1);
}

template <typename... Self>
int TextPanel<Self...>::hide() {
  setActive(0);
  return 1;
}

template <typename... Self>
bool TextPanel<Self...>::follows(const event_data* event) const {
  if (event == nullptr || read(showTimer).isPending()) return false;
  return select != 0 || isInside(event);
}

template <typename... Self>
char* TextPanel<Self...>::getText() {
  return text.text;
}

template <typename... Self>
unsigned int TextPanel<Self...>::getBgColor() {
  return read(rect.color);
}

template <typename... Self>
unsigned int TextPanel<Self...>::getTextColor() {
  return read(text.color);
}

template <typename... Self>
int TextPanel<Self...>::getFontSize() {
  return read(text.size);
}

template <typename... Self>
SKIA_Rect* TextPanel<Self...>::getPositionAndSize() {
  return &rect;
}

template <typename... Self>
void TextPanel<Self...>::setFontSize(int pixels) {
  write(text.size, pixels);
}

template <typename... Self>
void TextPanel<Self...>::setTextColor(unsigned int color) {
  write(text.color, color);
}

template <typename... Self>
void TextPanel<Self...>::setBgColor(unsigned int color) {
  write(rect.color, color);
}

template <typename... Self>
void TextPanel<Self...>::onShowTimer(int ms) {
  const unsigned int now = GetTicks();
  setActive(1);
  {
    const std::lock_guard guard(stateLock);
    showTimer.start(now, static_cast<unsigned int>(ms));
  }
  askForRedraw();
}

template <typename... Self>
void TextPanel<Self...>::onPress(event_data* event) {
  if (event == nullptr) return;
  ClassLog(word).print(LogLevel::Debug, "pressed!!");
  select = static_cast<int>(event->mouse.finger + 1);
  const LifeGuard self(this);
  call(press_cb);
  if (self.isAlive() && double_tap_cb != nullptr) taps.press(GetTicks());
}

template <typename... Self>
void TextPanel<Self...>::onRelease(event_data* event) {
  const ClassLog log(word);
  select = 0;
  if (isInside(event)) {
    const LifeGuard self(this);
    call(release_cb);
    if (self.isAlive() && double_tap_cb != nullptr && taps.isRunning()) onTouchClickCount();
  }
  log.print(LogLevel::Debug, "released!!");
}

template <typename... Self>
void TextPanel<Self...>::onPressLong(event_data*) {
  ClassLog(word).print(LogLevel::Debug, "long pressed!!");
  call(long_press_cb);
}

template <typename... Self>
void TextPanel<Self...>::onTouchClickCount() {
  const int count = taps.tap(GetTicks());
  if (count == 0) return;
  ClassLog(word).print(LogLevel::Debug, "onTouchClickCount!! %d", count);
  if (count == DoubleTap::kDouble) call(double_tap_cb);
}

template <typename... Self>
void TextPanel<Self...>::restoreColor() {
  {
    const std::lock_guard guard(stateLock);
    if (rect.color == saved_bg_color) return;
    rect.color = saved_bg_color;
  }
  askForRedraw();
}

template <typename... Self>
void TextPanel<Self...>::call(PanelCallback callback) {
  if (callback != nullptr) callback(0, static_cast<Self*>(this)...);
}

template <typename... Self>
bool TextPanel<Self...>::isInside(const event_data* event) const {
  const SKIA_Rect area = read(rect);
  return EventService::isMouseEventForMe(&area, event);
}

template class TextPanel<>;
template class TextPanel<Ime>;

}  // namespace MW
