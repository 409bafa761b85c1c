/// The callbacks that repeated keys have.
#pragma once

#include <MW/detail/key_clicks.h>

namespace MW {

/// Calls the callback of the second and of the third release of a series, `count` being what
/// KeyClicks::click() answered. The callback may delete the owner, and `clicks` with it.
template <typename Owner>
void tellKeyClicks(const Owner& owner, KeyClicks& clicks, int count) {
  constexpr int kDouble = 2;
  constexpr int kTriple = 3;
  if (count == kDouble && owner.doubleKeyCallback) owner.doubleKeyCallback(&clicks.lastKey);
  if (count == kTriple && owner.tripleKeyCallback) owner.tripleKeyCallback(&clicks.lastKey);
}

}  // namespace MW
