/// The callbacks that repeated keys have.
#pragma once

#include <MW/detail/key_clicks.h>

namespace MW {

/// Calls the callback of the second or of the third release of a series, `count` being what
/// KeyClicks::click() answered. The callback may delete the owner, and `clicks` with it: it is
/// given a copy of the key.
template <typename Owner>
void tellKeyClicks(const Owner& owner, const KeyClicks& clicks, int count) {
  constexpr int kDouble = 2;
  constexpr int kTriple = 3;
  kbd_event key = clicks.lastKey;
  if (count == kDouble && owner.doubleKeyCallback) return owner.doubleKeyCallback(&key);
  if (count == kTriple && owner.tripleKeyCallback) return owner.tripleKeyCallback(&key);
}

}  // namespace MW
