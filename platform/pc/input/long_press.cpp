#include "input/long_press.h"

#include <algorithm>

namespace brimol::pc {

namespace {

// Signed, since a time may lie a little before the press.
int32_t elapsedMs(uint32_t since, uint32_t now) { return static_cast<int32_t>(now - since); }

}  // namespace

void LongPress::press(ScreenPoint at, uint32_t now) {
  waits = true;
  pressedAt = at;
  pressedTime = now;
}

void LongPress::move(ScreenPoint to) {
  constexpr int64_t kPercent = 100;
  const int64_t dx = to.x - pressedAt.x;
  const int64_t dy = to.y - pressedAt.y;
  const int64_t slop = int64_t{screenWidth} * kSlopPercent;  // hundredths of a pixel
  const int64_t distanceSquared = (dx * dx + dy * dy) * kPercent * kPercent;
  if (distanceSquared > slop * slop) waits = false;
}

bool LongPress::due(uint32_t now) {
  if (msLeft(now) != 0u) return false;
  waits = false;
  return true;
}

std::optional<uint32_t> LongPress::msLeft(uint32_t now) const {
  if (!waits) return std::nullopt;
  const int32_t left = static_cast<int32_t>(kHoldMs) - elapsedMs(pressedTime, now);
  return static_cast<uint32_t>(std::max(left, 0));
}

}  // namespace brimol::pc
