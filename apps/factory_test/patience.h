/// Tries again for what another program is in the way of.
#pragma once

#include <chrono>
#include <cstdint>

namespace factory_test {

/// Says when to try and when to give up, while the screen goes on. Times are GetTicks()
/// milliseconds and may wrap.
class Patience {
 public:
  /// How long a try may hold up the screen.
  static constexpr std::chrono::milliseconds kTry{20};

  void start(uint32_t now) {
    waits = true;
    begun = now;
    tried = now;
  }
  void end() { waits = false; }
  bool isWaiting() const { return waits; }

  /// Once in every kPauseMs while it waits.
  bool takeTry(uint32_t now) {
    if (!waits || now - tried < kPauseMs) return false;
    tried = now;
    return true;
  }
  bool isOver(uint32_t now) const { return now - begun >= kMostMs; }

 private:
  static constexpr uint32_t kPauseMs = 100;
  static constexpr uint32_t kMostMs = 3000;

  bool waits = false;
  uint32_t begun = 0;
  uint32_t tried = 0;
};

}  // namespace factory_test
