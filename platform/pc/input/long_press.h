/// When a finger that stays down becomes a long press.
#pragma once

#include <cstdint>
#include <optional>

#include "input/event_records.h"

namespace brimol::pc {

/// Watches one finger. It becomes a long press, once, when it was held for kHoldMs and never moved
/// further than kSlopPercent of the screen's width from where it was pressed. Times are
/// milliseconds and may wrap.
class LongPress {
 public:
  static constexpr uint32_t kHoldMs = 500;
  static constexpr int kSlopPercent = 2;

  explicit LongPress(int width) : screenWidth(width) {}

  void press(ScreenPoint at, uint32_t now);
  void move(ScreenPoint to);
  void release() { waits = false; }
  /// True once, when the finger has become a long press.
  bool due(uint32_t now);
  /// Milliseconds until due() will be true, 0 when it is; none when nothing is to come.
  std::optional<uint32_t> msLeft(uint32_t now) const;

 private:
  int screenWidth;  // pixels
  bool waits = false;
  ScreenPoint pressedAt = {};
  uint32_t pressedTime = 0;
};

}  // namespace brimol::pc
