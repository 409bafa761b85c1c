/// A mouse that plays a second finger.
#pragma once

#include <SDL_keycode.h>

#include <cstdint>
#include <optional>
#include <vector>

#include "input/input_translator.h"

namespace brimol::pc {

/// Passes the left button on. While a Ctrl key is held it plays two fingers: the mouse's own, and
/// one opposite it as seen from where the mouse was when Ctrl went down. Both stay down until the
/// button is up. One thread uses it; positions are screen pixels.
class TwoFingerMouse {
 public:
  /// Where the two fingers are, for a display that shows them.
  struct Fingers {
    ScreenPoint mouse;
    ScreenPoint opposite;  // may lie beside the screen; the input clamps it
    ScreenPoint middle;
    bool areDown;
    friend bool operator==(const Fingers&, const Fingers&) = default;
  };

  /// `target` outlives it.
  explicit TwoFingerMouse(InputTranslator& target) : input(target) {}

  void press(ScreenPoint at, uint32_t now);
  void move(ScreenPoint to, uint32_t now);
  void release(ScreenPoint at, uint32_t now);

  /// Keys other than Ctrl change nothing.
  void keyDown(SDL_Keycode key);
  void keyUp(SDL_Keycode key);

  /// Forgets button and keys. The fingers are lifted by InputTranslator::releaseAll().
  void forget();

  /// None while the mouse plays one finger.
  std::optional<Fingers> fingers() const;

 private:
  static constexpr PointerId kOpposite = {-4, 0};

  ScreenPoint opposite() const { return {2 * middle.x - mouse.x, 2 * middle.y - mouse.y}; }

  InputTranslator& input;
  ScreenPoint mouse = {};
  ScreenPoint middle = {};
  std::vector<SDL_Keycode> controls;  // the Ctrl keys that are down
  bool arePressed = false;            // both fingers
};

}  // namespace brimol::pc
