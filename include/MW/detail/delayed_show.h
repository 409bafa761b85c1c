/// A widget that appears some time after it was told to.
#pragma once

#include <MW/detail/clock_order.h>

#include <cstdint>

namespace MW {

/// Until the first drawing pass at or after the due time the widget is not drawn and takes no
/// events. Times are GetTicks() milliseconds, compared by isOver(). The holder's lock guards it.
class DelayedShow {
 public:
  constexpr void start(uint32_t now, int delayMs) {
    due = now + static_cast<uint32_t>(delayMs);
    length = lengthOf(delayMs);
    pending = true;
  }
  constexpr bool isPending() const { return pending; }
  constexpr bool isDue(uint32_t now) const {
    return pending && (now == due || isOver(now, due, length));
  }

  /// A drawing pass: whether the widget is drawn in it.
  constexpr bool draws(uint32_t now) {
    if (isDue(now)) pending = false;
    return !pending;
  }

 private:
  uint32_t due = 0;
  uint32_t length = 0;
  bool pending = false;
};

}  // namespace MW
