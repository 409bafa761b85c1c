#include "input/two_finger_mouse.h"

#include <algorithm>
#include <utility>

namespace brimol::pc {

namespace {

bool isControl(SDL_Keycode key) { return key == SDLK_LCTRL || key == SDLK_RCTRL; }

}  // namespace

void TwoFingerMouse::press(ScreenPoint at, uint32_t now) {
  mouse = at;
  input.pointerDown(kMouse, at, now);
  if (controls.empty()) return;
  arePressed = true;
  input.pointerDown(kOpposite, opposite(), now);
}

void TwoFingerMouse::move(ScreenPoint to, uint32_t now) {
  mouse = to;
  input.pointerMove(kMouse, to, now);
  if (arePressed) input.pointerMove(kOpposite, opposite(), now);
}

void TwoFingerMouse::release(ScreenPoint at, uint32_t now) {
  mouse = at;
  input.pointerUp(kMouse, at, now);
  if (std::exchange(arePressed, false)) input.pointerUp(kOpposite, opposite(), now);
}

void TwoFingerMouse::keyDown(SDL_Keycode key) {
  if (!isControl(key) || std::ranges::count(controls, key) != 0) return;
  if (controls.empty() && !arePressed) middle = mouse;
  controls.push_back(key);
}

void TwoFingerMouse::keyUp(SDL_Keycode key) { std::erase(controls, key); }

void TwoFingerMouse::forget() {
  controls.clear();
  arePressed = false;
}

std::optional<TwoFingerMouse::Fingers> TwoFingerMouse::fingers() const {
  if (controls.empty() && !arePressed) return std::nullopt;
  return Fingers{mouse, opposite(), middle, arePressed};
}

}  // namespace brimol::pc
