/// The time that a test has used up.
#pragma once

#include <cstdint>

namespace factory_test {

/// Runs while the test can still be passed by what is done to the phone, not while the operator
/// judges or answers a question. Times are GetTicks() milliseconds and may wrap.
class TestClock {
 public:
  explicit TestClock(uint32_t now) : last(now) {}

  /// Comes in every round of the main loop, with what is so since the round before.
  void tick(uint32_t now, bool isRunning) {
    if (isRunning) sum += now - last;
    last = now;
  }
  /// Milliseconds.
  uint32_t used() const { return sum; }

 private:
  uint32_t last;
  uint32_t sum = 0;
};

}  // namespace factory_test
