/// From what pointers and keys do to input records.
#pragma once

#include <SDL_keycode.h>

#include <array>
#include <cstdint>
#include <optional>
#include <vector>

#include "input/input_service.h"
#include "input/long_press.h"
#include "input/pointers.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// Is told what happened, in its order, and posts the records that follow to `service`, which
/// outlives it. One thread uses it.
///
/// `now` is when it happened, in the service's milliseconds. Times may wrap, and one may lie a
/// little before the one of the call before. A long press that came due before is posted first.
/// Positions are screen pixels and are clamped to the screen.
class InputTranslator {
 public:
  InputTranslator(Size screenSize, InputService& target);

  /// A pointer went down. One that is down already moves there. With all fingers taken: nothing.
  void pointerDown(PointerId pointer, ScreenPoint at, uint32_t now);
  /// A pointer moved. One that is not down, or that stays on its pixel: nothing.
  void pointerMove(PointerId pointer, ScreenPoint to, uint32_t now);
  /// A pointer went up. While a Shift key is down, the mouse's finger stays down and is pinned
  /// until the last Shift key goes up. A pointer that is not down: nothing.
  void pointerUp(PointerId pointer, ScreenPoint at, uint32_t now);

  /// A key went down or up, the Shift keys too. A key that is down already (it repeats), up
  /// already, or plays none of the phone's keys: nothing. Two keys that play the same one: down
  /// with the first, up with the last.
  void keyDown(SDL_Keycode key);
  void keyUp(SDL_Keycode key);

  /// The window lost the focus or closes: lifts every finger and key, so that nothing sticks.
  void releaseAll();

  /// Posts the long presses that are due. To be called when msToLongPress() has passed.
  void tick(uint32_t now);
  /// Milliseconds until the next long press is due, 0 when one is; none when none is to come.
  std::optional<uint32_t> msToLongPress(uint32_t now) const;

 private:
  LongPress& longPressOf(int finger) { return longPresses[static_cast<std::size_t>(finger)]; }
  void moveFinger(int finger, ScreenPoint to);
  void liftFinger(int finger);
  void liftPinned();
  bool isShiftDown() const;
  bool isPhoneKeyDown(uint32_t code) const;
  ScreenPoint onScreen(ScreenPoint point) const;

  Size screen;
  InputService& service;
  Pointers pointers;
  std::vector<LongPress> longPresses;  // one for each finger
  std::vector<SDL_Keycode> keysDown;
};

}  // namespace brimol::pc
