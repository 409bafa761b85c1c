/// What the platform itself waits for.
#pragma once

#include "clock/turn_clock.h"

namespace brimol::pc {

/// While it lives, the calling thread keeps its turn though it may block: what it waits for ends by
/// itself, without another thread's turn. A null clock: nothing.
class InsideWait {
 public:
  explicit InsideWait(TurnClock* turns)
      : clock(turns), before(turns != nullptr && turns->setWaitsInside(true)) {}
  ~InsideWait() {
    if (clock != nullptr) clock->setWaitsInside(before);
  }
  InsideWait(const InsideWait&) = delete;
  InsideWait& operator=(const InsideWait&) = delete;

 private:
  TurnClock* clock;
  bool before;
};

}  // namespace brimol::pc
