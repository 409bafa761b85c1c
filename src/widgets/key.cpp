#include <MW/detail/clock_order.h>
#include <MW/key.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <optional>

#include "core/class_log.h"
#include "core/key_clicks.h"
#include "core/life_guard.h"

namespace MW {

namespace {

constexpr ClassLog kLog("KEY");
constexpr unsigned int kPlugHoldMs = 100;

constexpr bool isPassing(uint32_t code) {
  return code == Key::kPlugPassing1 || code == Key::kPlugPassing2;
}

}  // namespace

Key::Key() {
  setType(kBaseLayer);
  kLog.print(LogLevel::Debug, "call registerWidget");
  Window::registerWidget(this);
  setActive(1);
}

Key::~Key() { leaveWindow(); }

int Key::show() { return show(0); }

int Key::show(unsigned int) {
  if (!plugCallback) return 1;
  std::optional<kbd_event> settled;
  {
    const std::lock_guard guard(stateLock);
    if (!plugHeld || !isOver(GetTicks(), plugDue, kPlugHoldMs)) return 1;
    if (isPassing(plugEvent.code)) plugEvent.code = kPlugSettled;
    settled = plugEvent;
    plugHeld = false;
  }
  plugCallback(&*settled);
  return 1;
}

bool Key::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  switch (event->type) {
    case kEventPress: onPressTouch(event->mouse); return false;
    case kEventRelease: onReleaseTouch(event->mouse); return false;
    case kEventLongPress: onPressLong(event->mouse); return true;
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    case kEventApplication: return true;
    case kEventUser: onPlugKey(event->key); return true;
    default: return false;
  }
}

void Key::onPlugKey(kbd_event key) {
  if (!plugCallback) return;
  bool isTold = false;
  {
    const std::lock_guard guard(stateLock);
    if (key.code == kPlugSettled || isPassing(key.code)) {
      plugEvent = key;
      plugHeld = true;
      plugDue = GetTicks() + kPlugHoldMs;
      return;
    }
    if (isPassing(plugEvent.code)) return;
    isTold = plugEvent.code == kPlugSettled;
    plugHeld = false;
  }
  if (isTold) plugCallback(&key);
}

void Key::onPressTouch(mouse_event mouse) { touchPressCallback(&mouse); }
void Key::onReleaseTouch(mouse_event mouse) { touchReleaseCallback(&mouse); }
void Key::onPressKey(kbd_event key) { keyPressCallback(&key); }

void Key::onReleaseKey(kbd_event key) {
  keyClicks.follow(key, GetTicks());
  const LifeGuard self(this);
  onKeyClickCount(key);
  if (self.isAlive()) keyReleaseCallback(&key);
}

void Key::onPressLong(mouse_event mouse) {
  kLog.print(LogLevel::Debug, "long pressed!!");
  longPressCallback(&mouse);
}

void Key::onKeyClickCount(kbd_event key) {
  tellKeyClicks(*this, keyClicks, keyClicks.click(key.code, GetTicks()));
}

}  // namespace MW
