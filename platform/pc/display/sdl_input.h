/// From what SDL reports of mouse, touch and keyboard to what the input is told.
#pragma once

#include <SDL_events.h>

#include <optional>

#include "display/window_fit.h"
#include "input/input_translator.h"
#include "input/two_finger_mouse.h"
#include "input/wheel_drag.h"

namespace brimol::pc {

/// What the user sees: the picture in the window's pixels, and the window in the points of the
/// desktop, in which SDL counts where the mouse is.
struct WindowView {
  WindowFit fit;
  Size points;
};

/// Passes on the left button, the wheel, touches and keys. All other events are ignored, and so are
/// the touches that SDL derives from a mouse and the mouse events that it derives from touches. One
/// thread uses it; `now` is in the input's milliseconds: SDL's clock is another one.
class SdlInput {
 public:
  /// `target` outlives it.
  SdlInput(Size screen, InputTranslator& target)
      : input(target), mouse(target), wheel(screen, target) {}

  void take(const SDL_Event& event, const WindowView& view, uint32_t now);
  /// The window lost the focus or closes.
  void releaseAll();

  /// See WheelDrag.
  void tick(uint32_t now) { wheel.tick(now); }
  std::optional<uint32_t> msToTick(uint32_t now) const { return wheel.msToStep(now); }

  /// See TwoFingerMouse.
  std::optional<TwoFingerMouse::Fingers> fingers() const { return mouse.fingers(); }

 private:
  void takeButton(const SDL_MouseButtonEvent& button, ScreenPoint at, uint32_t now);
  void takeWheel(const SDL_MouseWheelEvent& turn, uint32_t now);
  void takeTouch(const SDL_TouchFingerEvent& touch, const WindowFit& fit, uint32_t now);

  InputTranslator& input;
  TwoFingerMouse mouse;
  WheelDrag wheel;
  ScreenPoint mouseAt = {};
};

}  // namespace brimol::pc
