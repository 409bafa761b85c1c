/// A mouse's wheel as a finger that drags.
#pragma once

#include <cstdint>
#include <optional>

#include "input/input_translator.h"

namespace brimol::pc {

/// Plays a finger that goes down where the mouse is, moves while the wheel turns, and lifts once
/// the wheel rests, so slowly that nothing is flung. At the screen's edge it lifts and goes on from
/// where it began. One thread uses it; times are the input's milliseconds and may wrap.
class WheelDrag {
 public:
  /// `target` outlives it.
  WheelDrag(Size screenSize, InputTranslator& target) : screen(screenSize), input(target) {}

  /// The wheel turned by so many notches: `toRight` and `up` are where it turned to, negative for
  /// the other way. What lies above on the screen comes down when it turns up, and so on. Turns
  /// that amount to less than a quarter of a notch wait for more, so that none is taken for a tap.
  void turn(ScreenPoint at, float toRight, float up, uint32_t now);

  /// Moves or lifts the finger. To be called when msToStep() has passed.
  void tick(uint32_t now);
  /// Milliseconds until the next step is due, 0 when one is; none when the finger is not down.
  std::optional<uint32_t> msToStep(uint32_t now) const;

  /// Forgets the drag. The finger is lifted with all others by InputTranslator::releaseAll().
  void forget();

 private:
  static constexpr PointerId kWheel = {-3, 0};

  struct Grip {
    ScreenPoint start;
    ScreenPoint at;
  };

  ScreenPoint next(ScreenPoint from) const;
  bool isThere() const { return right == 0 && down == 0; }
  void press(ScreenPoint at, uint32_t now);
  void lift(uint32_t now);
  void step(uint32_t now);
  void moveTo(ScreenPoint to, uint32_t now);

  Size screen;
  InputTranslator& input;
  std::optional<Grip> grip;  // none: the finger is up
  int right = 0;             // pixels that are left to go
  int down = 0;
  uint32_t nextStep = 0;
};

}  // namespace brimol::pc
