/// Keys whose contact opens and closes again.
#pragma once

#include <algorithm>
#include <atomic>
#include <cstdint>
#include <map>

namespace factory_test {

/// Counts presses that follow a release of the same key sooner than a finger can. It is told what
/// happened and when, in GetTicks() milliseconds, which may wrap, on one thread, and asked on any.
class KeyBounce {
 public:
  static constexpr uint32_t kFingerMs = 40;  ///< the least from a release to the next press

  void release(unsigned int code, uint32_t now) { released.insert_or_assign(code, now); }
  void press(unsigned int code, uint32_t now) {
    const auto last = released.find(code);
    if (last == released.end() || now - last->second >= kFingerMs) return;
    ++bounces;
    longest = std::max(longest.load(), now - last->second);
  }
  int count() const { return bounces; }
  uint32_t longestMs() const { return longest; }

 private:
  std::map<unsigned int, uint32_t> released;  // when, by code
  std::atomic<int> bounces = 0;
  std::atomic<uint32_t> longest = 0;
};

}  // namespace factory_test
