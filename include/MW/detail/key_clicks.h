/// One key released several times in quick succession.
#pragma once

#include <MW/records.h>

#include <cstdint>

namespace MW {

/// Counts the releases of one key, each of which comes within 1000 ms of the one before. Times are
/// GetTicks() milliseconds. It belongs to the thread that handles events, or to the holder's lock.
///
/// Sums of times wrap with the clock and are compared as they are. Where the clock starts over:
/// - A release before the wrap counts 1 if the one before lies in the last 1000 ms.
/// - The first release after the wrap joins one that lies further back, however old.
class KeyClicks {
 public:
  static constexpr uint32_t kWindowMs = 1000;
  static constexpr uint32_t kNoKey = 65535;

  /// Before a release is counted: another key than the last starts a series of its own.
  constexpr void follow(const kbd_event& key, uint32_t now) {
    if (key.code == lastKey.code) return;
    lastKey = key;
    count = 0;
    time = now;
  }
  /// Counts a release of the followed key and returns how many there were in a row. Any other key
  /// ends the series, and the answer is 0.
  constexpr int click(uint32_t code, uint32_t now) {
    if (code != lastKey.code) {
      count = 0;
      lastKey.code = kNoKey;
      return 0;
    }
    count = now >= time + kWindowMs ? 1 : count + 1;
    time = now;
    return count;
  }

  /// The followed key's release, as applications are given it.
  kbd_event lastKey = {kNoKey, kNoKey};
  uint32_t time = 0;  ///< when the series began or was last counted

 private:
  int count = 0;
};

}  // namespace MW
