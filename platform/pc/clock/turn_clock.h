/// Simulated time: the threads that use the platform take turns, and time jumps from one pause's
/// end to the next.
#pragma once

#include <sys/types.h>

#include <atomic>
#include <chrono>
#include <condition_variable>
#include <cstdint>
#include <functional>
#include <list>
#include <mutex>
#include <optional>
#include <string>
#include <thread>

#include "clock/cpu_share.h"
#include "clock/pace.h"

namespace brimol::pc {

/// Whether simulated time waits for real time.
enum class Speed { Free, Real };

/// A thread takes part from its first call on, until it ends. Of those that take part one has the
/// turn, until it pauses; the one whose pause ends first has the next, and of several the one that
/// came first. Time moves only then. So what the threads do, and when, depends on nothing else.
///
/// A thread that blocks while it has the turn, because it waits for one that does not have it,
/// loses it: it is away until its next call. Before a turn goes on, whatever runs of those that are
/// away comes to its next call or blocks again. One that blocks for two real seconds, outside of
/// the process, is named, and time then goes no faster than real time until it is back.
///
/// Threads other than the process's main one end before the clock is destroyed.
class TurnClock {
 public:
  /// Works at times of its own, while nobody has the turn: before the turns of the same moment.
  struct Agent {
    /// When, in milliseconds since the start; none: not by itself. What came from outside is due at
    /// `soonest`, a moment at which nobody had the turn yet. Called with the clock's lock.
    std::function<std::optional<uint64_t>(uint64_t soonest)> due;
    /// Called without it, on the thread that had the turn before.
    std::function<void(uint64_t now)> act;
  };
  /// Hears of a thread that blocks outside: its name and its number.
  using BlockedWatcher = std::function<void(const std::string& name, pid_t thread)>;
  struct Participant;  // a thread's place among the others

  /// `firstTicks` is what ticks() says at the start.
  TurnClock(uint32_t firstTicks, Speed wantedSpeed);
  ~TurnClock();
  TurnClock(const TurnClock&) = delete;
  TurnClock& operator=(const TurnClock&) = delete;

  /// To be set by the first thread, before there are others.
  void setAgent(Agent wanted) { agent = std::move(wanted); }
  /// Pauses end at whole multiples of so many milliseconds since the start, 1 before this is
  /// called: where days are to pass, a longer step saves turns.
  void setStep(uint32_t milliseconds) { step = milliseconds; }
  void setBlockedWatcher(BlockedWatcher watcher) { tellBlocked = std::move(watcher); }

  // By threads that take part.

  /// Returns once the calling thread has the turn. A thread that asks very often without a pause
  /// waits for the time to move, and pauses for a millisecond.
  void takePart();
  void takePartAsPoller();  ///< the same, on the thread whose pauses wakePoller() ends
  /// takePart(), and what the clock says then; wraps.
  uint32_t ticks();
  /// Pauses the calling thread for `ms` milliseconds, 1 at least.
  void delay(uint32_t ms);
  /// Has what the calling thread is about to wait for counted as work of its own, or not any more:
  /// what the platform itself waits for ends by itself. Returns what it was before.
  bool setWaitsInside(bool waits);

  // By any thread.

  uint64_t now() const { return time; }  ///< milliseconds since the start
  uint32_t ticksNow() const { return firstTick + static_cast<uint32_t>(time); }
  uint32_t ticksAtStart() const { return firstTick; }
  /// Ends the pause of the polling thread now. By the agent.
  void wakePoller();
  /// The agent may be due earlier than it said.
  void lookAtAgent();
  /// The calling thread does not take part and may run on any processor.
  void stayOutside() const { cpus.leave(); }

  // For threads that are yet to be started: so their order does not depend on when they run.

  Participant& announce(const char* name);
  void withdraw(Participant& announced);
  /// On the thread itself. Returns when it has the turn.
  void begin(Participant& announced);
  /// The calling thread takes part no more; follows from its end.
  void leave();

 private:
  using Lock = std::unique_lock<std::mutex>;

  Lock lockFor(Participant& me);
  Participant& self();
  Participant& add(const std::string& name);
  void sitDown(Participant& me);
  void drop(const std::function<bool(const Participant&)>& isToGo);
  void pause(Participant& me, uint32_t ms);
  uint64_t endOfPause(uint32_t ms) const;
  static void hearOfTurn(Participant& me);
  void passOn(Lock& lock);
  Participant* choose(Lock& lock);
  Participant* earliest();
  std::optional<uint64_t> agentDue();
  std::optional<uint64_t> nextMoment();
  void actAsAgent(Lock& lock, uint64_t due);
  void settle(Lock& lock);
  static bool isUnsettled(Participant& away);
  bool mayStillLetGo();
  static bool isStillToPoll(Participant& away);
  bool seemsToPoll(Participant& watched);
  void dropGone();
  void keep();
  void watchHolder(Lock& lock);
  static bool othersRun();
  void sendAway(Lock& lock, Participant& blocked);
  void callOutside(Lock& lock, Participant& blocked);
  void takeBack(Participant& me);
  void loosenPace();

  const uint64_t id;  // tells clocks apart, even if one takes the place of another
  const uint32_t firstTick;
  const Speed speed;
  const CpuShare cpus;
  uint32_t step = 1;
  Agent agent;
  BlockedWatcher tellBlocked;

  std::atomic<uint64_t> time = 0;              // written with the lock
  std::atomic<Participant*> holder = nullptr;  // has the turn; written with the lock

  std::mutex mutex;  // guards all below
  std::condition_variable keeperWakes;
  std::list<Participant> participants;  // in the order of their coming
  Pace pace;
  bool isPassing = false;  // a thread looks for who is next
  bool isOver = false;
  uint64_t turns = 0;

  // What the keeper saw of the thread that has the turn.
  uint64_t watchedTurn = 0;
  int looksOnThread = 0;
  int looksPolling = 0;
  std::chrono::steady_clock::time_point blockedSince;

  std::thread keeper;  // hands on the turn where no thread does, and watches the one that has it
};

}  // namespace brimol::pc
