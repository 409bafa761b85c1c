#include "display/sdl_input.h"

#include <algorithm>
#include <cmath>

namespace brimol::pc {
namespace {

// `share` is 0 to 1 of the window's side; what lies outside, or is no number, counts as an edge.
int pixelAt(float share, int side) {
  if (!(share > 0)) return 0;
  return static_cast<int>(std::fmin(share, 1.0f) * static_cast<float>(side));
}

// The pixel in the middle of a point.
int pixelOfPoint(int point, int pixels, int points) {
  return static_cast<int>((std::int64_t{point} * 2 + 1) * pixels / (std::int64_t{points} * 2));
}

ScreenPoint onScreen(int x, int y, const WindowView& view) {
  return view.fit.toScreen({pixelOfPoint(x, view.fit.window.w, std::max(view.points.w, 1)),
                            pixelOfPoint(y, view.fit.window.h, std::max(view.points.h, 1))});
}

}  // namespace

void SdlInput::take(const SDL_Event& event, const WindowView& view, uint32_t now) {
  switch (event.type) {
    case SDL_MOUSEBUTTONDOWN:
    case SDL_MOUSEBUTTONUP:
      return takeButton(event.button, onScreen(event.button.x, event.button.y, view), now);
    case SDL_MOUSEMOTION:
      if (event.motion.which == SDL_TOUCH_MOUSEID) return;
      mouseAt = onScreen(event.motion.x, event.motion.y, view);
      return mouse.move(mouseAt, now);
    case SDL_MOUSEWHEEL: return takeWheel(event.wheel, now);
    case SDL_FINGERDOWN:
    case SDL_FINGERUP:
    case SDL_FINGERMOTION: return takeTouch(event.tfinger, view.fit, now);
    case SDL_KEYDOWN:
      mouse.keyDown(event.key.keysym.sym);
      return input.keyDown(event.key.keysym.sym);
    case SDL_KEYUP: mouse.keyUp(event.key.keysym.sym); return input.keyUp(event.key.keysym.sym);
    default: return;
  }
}

void SdlInput::releaseAll() {
  mouse.forget();
  wheel.forget();
  input.releaseAll();
}

void SdlInput::takeButton(const SDL_MouseButtonEvent& button, ScreenPoint at, uint32_t now) {
  if (button.which == SDL_TOUCH_MOUSEID || button.button != SDL_BUTTON_LEFT) return;
  mouseAt = at;
  button.type == SDL_MOUSEBUTTONDOWN ? mouse.press(at, now) : mouse.release(at, now);
}

void SdlInput::takeWheel(const SDL_MouseWheelEvent& turn, uint32_t now) {
  if (turn.which == SDL_TOUCH_MOUSEID) return;
  wheel.turn(mouseAt, turn.preciseX, turn.preciseY, now);
}

void SdlInput::takeTouch(const SDL_TouchFingerEvent& touch, const WindowFit& fit, uint32_t now) {
  if (touch.touchId == SDL_MOUSE_TOUCHID) return;
  const PointerId finger = {touch.touchId, touch.fingerId};
  const ScreenPoint at =
      fit.toScreen({pixelAt(touch.x, fit.window.w), pixelAt(touch.y, fit.window.h)});
  switch (touch.type) {
    case SDL_FINGERDOWN: return input.pointerDown(finger, at, now);
    case SDL_FINGERUP: return input.pointerUp(finger, at, now);
    default: return input.pointerMove(finger, at, now);
  }
}

}  // namespace brimol::pc
