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
/// clock wraps: `now` may lie up to 49.7 days behind its beginning, and not before it.
constexpr bool isOver(uint32_t now, uint32_t end, uint32_t lengthMs) {
  return end - now > lengthMs;
}

}  // namespace MW
