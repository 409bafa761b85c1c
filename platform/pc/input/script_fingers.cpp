#include "input/script_fingers.h"

#include <algorithm>
#include <utility>

namespace brimol::pc {

ScriptFingers::ScriptFingers(Size screenSize, Post target)
    : screen(screenSize),
      post(std::move(target)),
      fingers(Pointers::kFingers, Finger{LongPress(screenSize.w)}) {}

ScreenPoint ScriptFingers::onScreen(ScreenPoint place) const {
  return {std::clamp(place.x, 0, screen.w - 1), std::clamp(place.y, 0, screen.h - 1)};
}

void ScriptFingers::press(int finger, ScreenPoint place, uint64_t now) {
  if (isDown(finger)) return move(finger, place);
  Finger& pressed = at(finger);
  pressed.isDown = true;
  pressed.place = onScreen(place);
  pressed.longPress.press(pressed.place, static_cast<uint32_t>(now));
  post(pointerRecord(BRIMOL_POINTER_DOWN, finger, pressed.place));
}

void ScriptFingers::move(int finger, ScreenPoint to) {
  Finger& moved = at(finger);
  const ScreenPoint from = std::exchange(moved.place, moved.isDown ? onScreen(to) : moved.place);
  if (!moved.isDown || from == moved.place) return;
  moved.longPress.move(moved.place);
  Event record = pointerRecord(BRIMOL_POINTER_MOTION, finger, moved.place);
  record.pointer.xrel = static_cast<int16_t>(moved.place.x - from.x);
  record.pointer.yrel = static_cast<int16_t>(moved.place.y - from.y);
  post(record);
}

void ScriptFingers::release(int finger) {
  Finger& released = at(finger);
  if (!released.isDown) return;
  released.isDown = false;
  released.longPress.release();
  post(pointerRecord(BRIMOL_POINTER_UP, finger, released.place));
}

void ScriptFingers::tick(uint64_t now) {
  for (int finger = 0; finger < Pointers::kFingers; ++finger) {
    if (!at(finger).longPress.due(static_cast<uint32_t>(now))) continue;
    post(pointerRecord(BRIMOL_LONG_PRESS, finger, position(finger)));
  }
}

std::optional<uint64_t> ScriptFingers::due(uint64_t now) const {
  std::optional<uint64_t> soonest;
  for (const Finger& each : fingers) {
    const std::optional<uint32_t> left = each.longPress.msLeft(static_cast<uint32_t>(now));
    if (left && (!soonest || now + *left < *soonest)) soonest = now + *left;
  }
  return soonest;
}

}  // namespace brimol::pc
