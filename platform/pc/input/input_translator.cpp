#include "input/input_translator.h"

#include <algorithm>

#include "input/keymap.h"

namespace brimol::pc {

namespace {

bool isShift(SDL_Keycode key) { return key == SDLK_LSHIFT || key == SDLK_RSHIFT; }

}  // namespace

InputTranslator::InputTranslator(Size screenSize, InputService& target)
    : screen(screenSize),
      service(target),
      longPresses(Pointers::kFingers, LongPress(screenSize.w)) {}

void InputTranslator::pointerDown(PointerId pointer, ScreenPoint at, uint32_t now) {
  if (pointers.fingerOf(pointer)) return pointerMove(pointer, at, now);
  tick(now);
  const ScreenPoint place = onScreen(at);
  const std::optional<int> finger = pointers.press(pointer, place);
  if (!finger) return;
  longPressOf(*finger).press(place, now);
  service.post(pointerRecord(BRIMOL_POINTER_DOWN, *finger, place));
}

void InputTranslator::pointerMove(PointerId pointer, ScreenPoint to, uint32_t now) {
  tick(now);
  const std::optional<int> finger = pointers.fingerOf(pointer);
  if (finger) moveFinger(*finger, onScreen(to));
}

void InputTranslator::pointerUp(PointerId pointer, ScreenPoint at, uint32_t now) {
  tick(now);
  const std::optional<int> finger = pointers.fingerOf(pointer);
  if (!finger) return;
  if (pointer == kMouse && isShiftDown()) {
    moveFinger(*finger, onScreen(at));
    pointers.pin(*finger);
    return;
  }
  pointers.move(*finger, onScreen(at));
  liftFinger(*finger);
}

void InputTranslator::keyDown(SDL_Keycode key) {
  const std::optional<uint32_t> code = phoneKey(key);
  if (!code && !isShift(key)) return;
  if (std::ranges::count(keysDown, key) != 0) return;
  const bool wasDown = code && isPhoneKeyDown(*code);
  keysDown.push_back(key);
  if (code && !wasDown) service.post(keyRecord(BRIMOL_KEY_DOWN, *code));
}

void InputTranslator::keyUp(SDL_Keycode key) {
  if (std::erase(keysDown, key) == 0) return;
  if (isShift(key) && !isShiftDown()) liftPinned();
  const std::optional<uint32_t> code = phoneKey(key);
  if (code && !isPhoneKeyDown(*code)) service.post(keyRecord(BRIMOL_KEY_UP, *code));
}

void InputTranslator::releaseAll() {
  while (!keysDown.empty()) keyUp(keysDown.back());
  for (int finger = 0; finger < Pointers::kFingers; ++finger) {
    if (pointers.isDown(finger)) liftFinger(finger);
  }
}

void InputTranslator::tick(uint32_t now) {
  for (int finger = 0; finger < Pointers::kFingers; ++finger) {
    if (!longPressOf(finger).due(now)) continue;
    service.post(pointerRecord(BRIMOL_LONG_PRESS, finger, pointers.position(finger)));
  }
}

std::optional<uint32_t> InputTranslator::msToLongPress(uint32_t now) const {
  std::optional<uint32_t> soonest;
  for (const LongPress& longPress : longPresses) {
    const std::optional<uint32_t> left = longPress.msLeft(now);
    if (left && (!soonest || *left < *soonest)) soonest = left;
  }
  return soonest;
}

void InputTranslator::moveFinger(int finger, ScreenPoint to) {
  const ScreenPoint from = pointers.position(finger);
  if (to == from) return;
  pointers.move(finger, to);
  longPressOf(finger).move(to);
  Event record = pointerRecord(BRIMOL_POINTER_MOTION, finger, to);
  record.pointer.xrel = static_cast<int16_t>(to.x - from.x);
  record.pointer.yrel = static_cast<int16_t>(to.y - from.y);
  service.post(record);
}

void InputTranslator::liftFinger(int finger) {
  pointers.lift(finger);
  longPressOf(finger).release();
  service.post(pointerRecord(BRIMOL_POINTER_UP, finger, pointers.position(finger)));
}

void InputTranslator::liftPinned() {
  for (int finger = 0; finger < Pointers::kFingers; ++finger) {
    if (pointers.isPinned(finger)) liftFinger(finger);
  }
}

bool InputTranslator::isShiftDown() const { return std::ranges::any_of(keysDown, isShift); }

bool InputTranslator::isPhoneKeyDown(uint32_t code) const {
  return std::ranges::any_of(keysDown, [&](SDL_Keycode key) { return phoneKey(key) == code; });
}

ScreenPoint InputTranslator::onScreen(ScreenPoint point) const {
  return {std::clamp(point.x, 0, screen.w - 1), std::clamp(point.y, 0, screen.h - 1)};
}

}  // namespace brimol::pc
