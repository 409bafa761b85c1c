/// Two taps in quick succession.
#pragma once

#include <cstdint>

namespace MW {

/// Counts taps, each of which ends within 500 ms of the one before. Times are GetTicks()
/// milliseconds; 0 stands for none. Use it on the thread that handles events only.
///
/// Sums and differences of times wrap with the clock and are compared as they are. Where the clock
/// starts over:
/// - A tap that ends before the wrap counts 0 if its press, or the tap before it in the series,
/// lies
///   in the last 500 ms before the wrap.
/// - In the first 500 ms after the wrap a press forgets each tap since the wrap: taps count 1.
/// - If the first press after the wrap comes later than that, its tap joins the last tap before the
///   wrap, however old.
class DoubleTap {
 public:
  static constexpr uint32_t kWindowMs = 500;
  static constexpr int kDouble = 2;  ///< what tap() answers to a double tap

  /// A press: forgets a tap that lies too far back, and starts the time if none runs.
  constexpr void press(uint32_t now) {
    if (isStale(now)) reset();
    if (time == 0) time = now;
  }
  constexpr bool isRunning() const { return time != 0; }
  /// Whether the last tap lies too far back to be one of two.
  constexpr bool isStale(uint32_t now) const { return time != 0 && time < now - kWindowMs; }
  /// A completed tap: how many there were in a row, or 0 for one that came too late and starts the
  /// count anew.
  constexpr int tap(uint32_t now) {
    if (now >= time + kWindowMs) {
      reset();
      return 0;
    }
    time = now;
    return ++count;
  }
  constexpr void reset() { *this = DoubleTap(); }

 private:
  uint32_t time = 0;
  int count = 0;
};

}  // namespace MW
