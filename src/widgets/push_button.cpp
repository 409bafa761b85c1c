#include <MW/c_api.h>
#include <MW/push_button.h>
#include <brimol/input.h>

#include "core/class_log.h"
#include "core/life_guard.h"
#include "core/redraw.h"

namespace MW {

// 0 is no time here: half of the clock's times are earlier.
int PushButton::show() { return read(delayedShow).isPending() ? 1 : show(0); }

void PushButton::updateTimer(unsigned int ticks) {
  if (read(delayedShow).isDue(ticks)) isDisplayUpdate_c(1);
}

int PushButton::hide() {
  setActive(0);
  restoreFace();
  return 1;
}

bool PushButton::onRecvEvent(event_data* event, unsigned int) {
  if (!isReachedBy(event)) return false;
  return event->type == kEventMotion ? moveAcross(event) : handleGesture(event);
}

// A held button follows every finger, wherever it is.
bool PushButton::isReachedBy(const event_data* event) const {
  return event != nullptr && !read(delayedShow).isPending() &&
         (hold.isHeld() || isUnder(rect, event));
}

bool PushButton::handleGesture(event_data* event) {
  switch (event->type) {
    case kEventPress: onPress(event); return true;
    case kEventRelease: onRelease(event); return true;
    case kEventLongPress: onPressLong(event); return true;
    default: return false;
  }
}

bool PushButton::moveAcross(event_data* event) {
  if (!hold.isHeld()) return false;
  // Still held outside, and not highlighted again when the finger comes back.
  if (!isUnder(rect, event)) restoreFace();
  return true;
}

void PushButton::onShowTimer(int ms) {
  const unsigned int now = GetTicks();
  {
    const std::lock_guard guard(stateLock);
    delayedShow.start(now, ms);
  }
  setActive(1);
  askForRedraw();
}

void PushButton::onPress(event_data* event) {
  if (event == nullptr) return;
  ClassLog(word).print(LogLevel::Debug, "pressed!!");
  write(rect.color, kColorHighlight);
  holdBy(event);
}

void PushButton::holdBy(const event_data* event) {
  hold.press(event->mouse);
  const LifeGuard self(this);
  pressCallback(0);
  if (self.isAlive() && doubleClickCallback) clicks.press(GetTicks());
}

void PushButton::onRelease(event_data* event) {
  const ClassLog log(word);
  hold.letGo();
  restoreFace();
  clickAt(event);
  log.print(LogLevel::Debug, "released!!");
}

void PushButton::clickAt(const event_data* event) {
  if (!isUnder(rect, event)) return;
  const LifeGuard self(this);
  clickCallback(0);
  if (self.isAlive() && doubleClickCallback && clicks.isRunning()) onTouchClickCount();
}

void PushButton::onPressLong(event_data*) {
  ClassLog(word).print(LogLevel::Debug, "long pressed!!");
  // Without a callback the button stays held, and its release is still a click.
  if (!longPressCallback) return;
  const LifeGuard self(this);
  longPressCallback(0);
  if (!self.isAlive()) return;
  hold.letGo();
  restoreFace();
}

void PushButton::onTouchClickCount() {
  const int count = clicks.tap(GetTicks());
  if (count == 0) return;
  ClassLog(word).print(LogLevel::Debug, "onTouchClickCount!! %d", count);
  if (count == DoubleTap::kDouble) doubleClickCallback(0);
}

}  // namespace MW
