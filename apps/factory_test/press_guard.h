/// What a finger meant that a new button did not wait for.
#pragma once

#include <cstdint>
#include <utility>

namespace factory_test {

/// Tells the clicks that were meant for a button from those that only hit it: one counts if its
/// press came to the button, and not before it had been there for a while. Dispatch thread.
class PressGuard {
 public:
  static constexpr uint32_t kDeafMs = 700;

  /// `since`: when the button appeared, in GetTicks() milliseconds.
  explicit PressGuard(uint32_t since = 0) : appeared(since) {}

  /// Whether it is too early, for keys too.
  bool isDeaf(uint32_t now) const { return now - appeared < kDeafMs; }
  void press(uint32_t now) { pressed = !isDeaf(now); }
  /// Whether a click counts.
  bool takeClick() { return std::exchange(pressed, false); }

 private:
  uint32_t appeared;
  bool pressed = false;
};

}  // namespace factory_test
