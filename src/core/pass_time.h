/// The time that a drawing call is given.
#pragma once

#include <MW/detail/clock_order.h>
#include <MW/detail/delayed_show.h>
#include <brimol/input.h>

#include <cstdint>

namespace MW {

/// Whether it is none: 0, with which what is drawn outside of passes is called, and which the clock
/// does not read now. Then no time ends.
inline bool isNoTime(uint32_t ticks) { return ticks == 0 && GetTicks() != 0; }

/// isOver() for such a time.
inline bool hasEnded(uint32_t ticks, uint32_t end, uint32_t lengthMs) {
  return !isNoTime(ticks) && isOver(ticks, end, lengthMs);
}

/// DelayedShow::draws() for such a time.
inline bool drawsAt(DelayedShow& delayed, uint32_t ticks) {
  return isNoTime(ticks) ? !delayed.isPending() : delayed.draws(ticks);
}

}  // namespace MW
