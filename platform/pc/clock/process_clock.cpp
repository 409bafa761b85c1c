#include "clock/process_clock.h"

namespace brimol::pc {

namespace {

constinit ClockMaker clockMaker = nullptr;

}  // namespace

void setClockMaker(ClockMaker maker) { clockMaker = maker; }

TurnClock* turnClock() {
  static TurnClock* const clock = clockMaker == nullptr ? nullptr : clockMaker();
  return clock;
}

}  // namespace brimol::pc
