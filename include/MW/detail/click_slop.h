/// What tells a click on a row from a drag of the list.
#pragma once

#include <cstdint>

namespace MW {

/// Remembers the row under the press, and gives it up once the finger has moved too far. The
/// holder's lock guards it.
class ClickSlop {
 public:
  static constexpr int kNone = -100;  ///< no row, or a click that was given up

  constexpr void press(int row) {
    pressed = row;
    sumX = 0;
    sumY = 0;
  }
  constexpr int row() const { return pressed; }
  /// Motion by so many pixels. The click is given up when the sum of either direction exceeds
  /// `slop`.
  constexpr void move(int dx, int dy, int slop) {
    if (pressed == kNone) return;
    sumX += dx;
    sumY += dy;
    if (isBeyond(sumX, slop) || isBeyond(sumY, slop)) pressed = kNone;
  }

 private:
  static constexpr bool isBeyond(int64_t sum, int slop) { return sum > slop || -sum > slop; }

  int pressed = kNone;
  int64_t sumX = 0;  // pixels since the press
  int64_t sumY = 0;
};

}  // namespace MW
