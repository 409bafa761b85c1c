/// What the input calls work on: the queue of records, the clock and its pauses.
#pragma once

#include <chrono>
#include <condition_variable>
#include <cstdint>
#include <functional>
#include <mutex>
#include <optional>
#include <thread>

#include "clock/clock.h"
#include "clock/turn_clock.h"
#include "input/early_ends.h"
#include "input/input_queue.h"

namespace brimol::pc {

/// Guards the queue and the clock, and lets threads pause until time or a record comes.
/// Any thread may call any operation.
class InputService {
 public:
  InputService() = default;
  InputService(const InputService&) = delete;
  InputService& operator=(const InputService&) = delete;

  /// Records are taken from here on. The clock stays as it is.
  void open();
  /// Drops the records that wait, lets go of the clock, and with that ends every pause that waits
  /// for the hand. A closed service ignores records and has none.
  void close();

  /// Adds a record and ends the polling thread's pause.
  void post(const Event& record);
  /// From here on post() hands its records to `taker` instead, and deliver() is what adds them. To
  /// be called before others use the service.
  void divert(std::function<void(const Event& record)> taker) { diversion = std::move(taker); }
  void deliver(const Event& record);
  /// From here on now() is what `turns` says, which outlives the service.
  void follow(const TurnClock* turns) { followed = turns; }
  /// Moves the next record to `record` and returns true, or returns false when none waits. The
  /// calling thread is the polling thread from here on.
  bool poll(Event& record);

  /// When the first record came since this was last asked, by the steady clock; none where none
  /// came.
  std::optional<std::chrono::steady_clock::time_point> takeFirstArrival();

  /// Milliseconds; wraps.
  uint32_t now() const;
  /// Pauses the calling thread for `ms` milliseconds of the clock. Ends early on the polling thread
  /// while a record waits, and on every thread when the clock is taken by hand or let go. While
  /// time is real, input ends pauses of other threads, too (see EarlyEnds), and those of a
  /// millisecond last kIdlePauseMs when nothing has come in or was drawn for kIdleAfter.
  void delay(uint32_t ms);
  /// When a pause of `ms` milliseconds ends that begins at `start`, if nothing ends it early.
  std::chrono::steady_clock::time_point endOfPause(std::chrono::steady_clock::time_point start,
                                                   uint32_t ms) const;
  /// Something was drawn.
  void hearOfFrame();

  static constexpr uint32_t kIdlePauseMs = 4;
  static constexpr std::chrono::seconds kIdleAfter{1};

  /// See Clock. What waited for the time that is reached goes on.
  void takeHand(uint32_t start);
  void advance(uint32_t ms);
  void letGo();
  /// `watcher` is called after every takeHand, advance, letGo and close, on the thread that called
  /// these; it may not set a watcher. Empty: none. The watcher before is not running any more when
  /// this returns.
  void setTimeWatcher(std::function<void()> watcher);

 private:
  using Lock = std::unique_lock<std::mutex>;
  using Time = std::chrono::steady_clock::time_point;

  void tellTime();
  void pauseByHand(Lock& lock, uint32_t ms);
  void pausePoller(Lock& lock, Time end);
  void pauseOther(Lock& lock, uint32_t ms, Time end);
  Time endOf(Time start, uint32_t ms) const;

  mutable std::mutex mutex;      // guards all up to watcherMutex
  std::condition_variable wake;  // a record arrived for the polling thread, or the hand moved
  EarlyEnds earlyEnds;
  Clock clock;
  InputQueue queue;
  bool isOpen = false;
  std::optional<std::chrono::steady_clock::time_point> firstArrival;
  uint32_t handChanges = 0;  // how often the hand was put on or taken off
  std::thread::id poller;
  Time lastActivity;  // a record arrived, or something was drawn

  // Set before other threads come.
  std::function<void(const Event&)> diversion;
  const TurnClock* followed = nullptr;

  std::mutex watcherMutex;  // guards timeWatcher, and is held while it runs
  std::function<void()> timeWatcher;
};

/// The one that the C calls work on. It lives as long as the process: threads may poll to the end.
InputService& inputService();

}  // namespace brimol::pc
