/// How fast simulated time may go.
#pragma once

#include <chrono>
#include <cstdint>

namespace brimol::pc {

/// Ties simulated milliseconds to real ones, from a moment on. Where the machine lags, simulated
/// time catches up. Not guarded: TurnClock is.
class Pace {
 public:
  using RealTime = std::chrono::steady_clock::time_point;

  /// From now on no faster than real time, starting at `simulated`.
  void start(uint64_t simulated) {
    isOn = true;
    begun = simulated;
    realBegin = std::chrono::steady_clock::now();
  }
  /// As fast as it can.
  void stop() { isOn = false; }
  bool isStarted() const { return isOn; }

  /// The real time of a simulated one. The pace is started.
  RealTime realAt(uint64_t simulated) const {
    return realBegin + std::chrono::milliseconds(simulated > begun ? simulated - begun : 0);
  }
  bool isReached(uint64_t simulated) const {
    return !isOn || realAt(simulated) <= std::chrono::steady_clock::now();
  }
  /// The simulated time that real time has come to; `begun` where it is not started.
  uint64_t reached() const {
    using std::chrono::duration_cast;
    using std::chrono::milliseconds;
    if (!isOn) return begun;
    const auto passed = std::chrono::steady_clock::now() - realBegin;
    return begun + static_cast<uint64_t>(duration_cast<milliseconds>(passed).count());
  }

 private:
  bool isOn = false;
  uint64_t begun = 0;
  RealTime realBegin;
};

}  // namespace brimol::pc
