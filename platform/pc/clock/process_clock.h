/// The clock of the process.
#pragma once

namespace brimol::pc {

class TurnClock;

/// Gives the process's turn clock, or null for real time.
using ClockMaker = TurnClock* (*)();

/// To be told before the first call of turnClock().
void setClockMaker(ClockMaker maker);

/// What the maker gave at the first call; null without one: time is real, and InputService's. Any
/// thread.
TurnClock* turnClock();

}  // namespace brimol::pc
