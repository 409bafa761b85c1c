/// The order of two times of a clock that wraps.
#pragma once

#include <cstdint>

namespace MW {

/// Whether `time` comes after `other`, by their difference: GetTicks() milliseconds that lie less
/// than 2^31 (24.8 days) apart, whether the clock wraps between them or not.
constexpr bool isLater(uint32_t time, uint32_t other) {
  return static_cast<int32_t>(time - other) > 0;
}

}  // namespace MW
