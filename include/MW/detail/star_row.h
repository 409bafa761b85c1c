/// The row of asterisks that shows that something goes on.
#pragma once

#include <brimol/scene.h>

#include <cstdint>
#include <cstring>

namespace MW {

/// Counts steps of a little over 100 ms. Times are GetTicks() milliseconds. Their difference is
/// unsigned: the wrap does no harm, and after a start in the future the first step is due at once.
/// The holder's lock guards it.
class StarRow {
 public:
  constexpr void restart(uint32_t at) {
    steps = 0;
    last = at;
  }
  /// The next step is counted from here.
  constexpr void delay(uint32_t now) { last = now; }
  constexpr bool isDue(uint32_t now) const { return now - last > kStepMs; }
  /// True when a step was due: it is taken.
  constexpr bool step(uint32_t now) {
    if (!isDue(now)) return false;
    last = now;
    ++steps;
    return true;
  }
  /// Steps since the start.
  constexpr uint32_t count() const { return steps; }

 private:
  static constexpr uint32_t kStepMs = 100;
  uint32_t steps = 0;
  uint32_t last = 0;
};

/// Makes the text `stars` asterisks; 1 for fewer, and at most what the record holds.
inline void putStars(SKIA_Text& record, uint32_t stars) {
  constexpr uint32_t kMost = SKIA_TEXT_BYTES - 1;
  const uint32_t count = stars < 1 ? 1 : stars > kMost ? kMost : stars;
  std::memset(record.text, '*', count);
  record.text[count] = '\0';
  record.string_len = static_cast<int32_t>(count);
}

}  // namespace MW
