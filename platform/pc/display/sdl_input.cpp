#include "display/sdl_input.h"

#include <cmath>

namespace brimol::pc {
namespace {

using PointerAction = void (InputTranslator::*)(PointerId, ScreenPoint, uint32_t);

// Where pointers go, and what it takes to tell where and when they did.
struct Target {
  const WindowFit& fit;
  uint32_t now;
  InputTranslator& input;

  void point(PointerAction action, PointerId pointer, WindowPoint at) const {
    (input.*action)(pointer, fit.toScreen(at), now);
  }
};

// `share` is 0 to 1 of the window's side; what lies outside, or is no number, counts as an edge.
int pixelAt(float share, int side) {
  if (!(share > 0)) return 0;
  return static_cast<int>(std::fmin(share, 1.0f) * static_cast<float>(side));
}

void passTouch(PointerAction action, const SDL_TouchFingerEvent& touch, const Target& target) {
  if (touch.touchId == SDL_MOUSE_TOUCHID) return;
  target.point(action, {touch.touchId, touch.fingerId},
               {pixelAt(touch.x, target.fit.window.w), pixelAt(touch.y, target.fit.window.h)});
}

void passButton(PointerAction action, const SDL_MouseButtonEvent& button, const Target& target) {
  if (button.which == SDL_TOUCH_MOUSEID || button.button != SDL_BUTTON_LEFT) return;
  target.point(action, kMouse, {button.x, button.y});
}

void passMotion(const SDL_MouseMotionEvent& motion, const Target& target) {
  if (motion.which == SDL_TOUCH_MOUSEID) return;
  target.point(&InputTranslator::pointerMove, kMouse, {motion.x, motion.y});
}

}  // namespace

void passOn(const SDL_Event& event, const WindowFit& fit, uint32_t now, InputTranslator& input) {
  const Target target = {fit, now, input};
  switch (event.type) {
    case SDL_MOUSEBUTTONDOWN:
      return passButton(&InputTranslator::pointerDown, event.button, target);
    case SDL_MOUSEBUTTONUP: return passButton(&InputTranslator::pointerUp, event.button, target);
    case SDL_MOUSEMOTION: return passMotion(event.motion, target);
    case SDL_FINGERDOWN: return passTouch(&InputTranslator::pointerDown, event.tfinger, target);
    case SDL_FINGERUP: return passTouch(&InputTranslator::pointerUp, event.tfinger, target);
    case SDL_FINGERMOTION: return passTouch(&InputTranslator::pointerMove, event.tfinger, target);
    case SDL_KEYDOWN: return input.keyDown(event.key.keysym.sym);
    case SDL_KEYUP: return input.keyUp(event.key.keysym.sym);
    default: return;
  }
}

}  // namespace brimol::pc
