/// The order of two times of a clock that wraps.
#pragma once

#include <cstdint>

namespace MW {

/// Whether `time` comes after `other`, by their difference: GetTicks() milliseconds that lie less
/// than 2^31 (24.8 days) apart, whether the clock wraps between them or not.
constexpr bool isLater(uint32_t time, uint32_t other) {
  return static_cast<int32_t>(time - other) > 0;
}

/// Whether a time of `lengthMs` milliseconds that ends at `end` is over at `now`, wherever the
/// clock wraps: up to 49.7 days behind its beginning, and not a second before it, where a drawing
/// pass stands that another thread overtook.
constexpr bool isOver(uint32_t now, uint32_t end, uint32_t lengthMs) {
  constexpr uint32_t kOvertakenMs = 1000;
  return end - now > lengthMs + kOvertakenMs;
}

/// The length for isOver() of a time that an application gave: one below 0 is over already.
constexpr uint32_t lengthOf(int ms) { return ms < 0 ? 0 : static_cast<uint32_t>(ms); }

}  // namespace MW
