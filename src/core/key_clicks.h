/// The callbacks that repeated keys have.
#pragma once

#include <MW/detail/key_clicks.h>
#include <MW/widget.h>

namespace MW {

/// Counts the release of a key and calls the widget's callback for the second and the third of a
/// series. The callback may delete the widget, and `clicks` with it.
inline void countKeyRelease(const Widget& widget, KeyClicks& clicks, uint32_t code, uint32_t now) {
  constexpr int kDouble = 2;
  constexpr int kTriple = 3;
  const int count = clicks.click(code, now);
  if (count == kDouble) widget.doubleKeyCallback(&clicks.lastKey);
  if (count == kTriple) widget.tripleKeyCallback(&clicks.lastKey);
}

}  // namespace MW
