/// What the turn clock knows of a thread.
#pragma once

#include "clock/turn_clock.h"
#include "clock/turn_signal.h"

namespace brimol::pc {

struct TurnClock::Participant {
  enum class State { Running, Waiting, Away, Left };

  std::string name;
  pid_t thread = 0;  // 0: not started yet
  State state = State::Waiting;
  uint64_t wake = 0;  // when its pause ends
  bool isPoller = false;
  bool polls = false;         // away, and looks again and again whether it can go on
  uint64_t sleepsBefore = 0;  // of one that polls, as the clock last looked
  bool isOutside = false;     // away, and named as one that blocks outside
  int calls = 0;              // since its pause; the thread's own
  std::atomic<bool> waitsInside = false;
  std::atomic<bool> arrives = false;                   // waits for the clock's lock, or is about to
  std::optional<std::chrono::milliseconds> cpuBefore;  // away, and seen running: when first seen
  std::chrono::steady_clock::time_point pollsSince;    // away, and polls: the same

  TurnSignal granted;                  // has the turn, and is to hear of it
  std::atomic<bool> isAtWork = false;  // has the turn, and knows it
};

}  // namespace brimol::pc
