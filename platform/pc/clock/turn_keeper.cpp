// What the turn clock does for threads that block or end: the part of it that looks at threads from
// outside.
#include <algorithm>
#include <utility>

#include "clock/participant.h"
#include "clock/thread_look.h"
#include "clock/turn_clock.h"

namespace brimol::pc {

namespace {

using std::chrono::steady_clock;

constexpr std::chrono::milliseconds kLookPause{1};
constexpr std::chrono::microseconds kSettlePause{30};
constexpr std::chrono::seconds kBlockedBound{2};
constexpr int kLooksOnThread = 2;    // in a row, before a thread counts as blocked
constexpr int kLooksPolling = 4;     // in a row, before it counts as one that polls
constexpr uint64_t kPollSleeps = 3;  // between two looks
constexpr uint64_t kSureSleeps = 2;  // so many later a thread that polls has looked once more

}  // namespace

// Threads that are away and run are on their way to their next call; a thread that left wakes
// whoever waits for its end. Both come first, however long the machine takes.
void TurnClock::settle(Lock& lock) {
  for (Participant& each : participants) {
    if (each.polls) each.sleepsBefore = sleepsOf(each.thread);
  }
  while (!isOver) {
    dropGone();
    if (std::ranges::none_of(participants, isUnsettled) && !mayStillLetGo()) return;
    lock.unlock();
    std::this_thread::sleep_for(kSettlePause);
    lock.lock();
  }
}

// Not one that has worked for long without a call: it does something else.
bool TurnClock::isUnsettled(Participant& away) {
  if (away.state == Participant::State::Left) return true;
  if (away.state != Participant::State::Away) return false;
  if (away.polls) return isStillToPoll(away);
  if (lookAt(away.thread) != ThreadState::Running) {
    if (away.arrives) return true;
    away.cpuBefore.reset();
    return false;
  }
  const auto spent = cpuTimeOf(away.thread);
  if (!away.cpuBefore) away.cpuBefore = spent;
  return spent - *away.cpuBefore < kBlockedBound;
}

// A thread that has given up its turn and does not sleep yet may hold what the runtime guards
// within itself, and what is away may wait for that. The calling thread holds nothing.
bool TurnClock::mayStillLetGo() {
  using State = Participant::State;
  const auto isAway = [](const Participant& each) { return each.state == State::Away; };
  if (std::ranges::none_of(participants, isAway)) return false;
  return std::ranges::any_of(participants, [me = ::gettid()](const Participant& each) {
    return each.state == State::Waiting && each.thread != 0 && each.thread != me &&
           lookAt(each.thread) == ThreadState::Running;
  });
}

// It sleeps for real time, and sees what the last turn did only when it wakes up.
bool TurnClock::isStillToPoll(Participant& away) {
  if (away.arrives) return true;
  if (sleepsOf(away.thread) >= away.sleepsBefore + kSureSleeps) {
    away.pollsSince = {};
    return false;
  }
  const auto now = steady_clock::now();
  if (away.pollsSince == steady_clock::time_point()) away.pollsSince = now;
  const bool waitsForThread = lookAt(away.thread) == ThreadState::OnThread;
  away.polls = !waitsForThread && now - away.pollsSince < kBlockedBound;
  return true;  // judged anew, as any other one if it does not poll any more
}

void TurnClock::dropGone() {
  using State = Participant::State;
  drop([](const Participant& each) {
    const bool mayBeGone = each.state == State::Left || each.state == State::Away;
    return mayBeGone && lookAt(each.thread) == ThreadState::Gone;
  });
}

void TurnClock::keep() {
  cpus.leave();
  Lock lock(mutex);
  while (!isOver) {
    if (holder == nullptr) passOn(lock);
    const auto moment = holder == nullptr && pace.isStarted() ? nextMoment() : std::nullopt;
    if (moment) {
      keeperWakes.wait_until(lock, pace.realAt(*moment));
    } else {
      keeperWakes.wait_for(lock, kLookPause);
    }
    watchHolder(lock);
  }
}

void TurnClock::watchHolder(Lock& lock) {
  Participant* const watched = holder;
  if (watched == nullptr || watched->waitsInside) return;
  const auto now = steady_clock::now();
  // What waits for the clock's own lock, or to hear that it has the turn, is no more than slow.
  const bool isSlow = !watched->isAtWork;
  const ThreadState looked = isSlow ? ThreadState::Running : lookAt(watched->thread);
  const ThreadState state = watched->arrives ? ThreadState::Running : looked;
  if (turns != std::exchange(watchedTurn, turns) || state == ThreadState::Running) {
    looksOnThread = 0;
    looksPolling = 0;
    blockedSince = now;
    return;
  }
  if (state == ThreadState::Gone) return sendAway(lock, *watched);
  if (seemsToPoll(*watched)) {
    watched->polls = true;
    return sendAway(lock, *watched);
  }
  looksOnThread = state == ThreadState::OnThread ? looksOnThread + 1 : 0;
  if (looksOnThread >= kLooksOnThread && !othersRun()) return sendAway(lock, *watched);
  if (now - blockedSince >= kBlockedBound) callOutside(lock, *watched);
}

// A thread that sleeps for moments, over and over, waits for something that another one does.
bool TurnClock::seemsToPoll(Participant& watched) {
  const uint64_t sleeps = sleepsOf(watched.thread);
  const uint64_t before = std::exchange(watched.sleepsBefore, sleeps);
  looksPolling = sleeps >= before + kPollSleeps ? looksPolling + 1 : 0;
  return looksPolling >= kLooksPolling;
}

// While any other thread runs, it may be about to let go of what is waited for: one that takes no
// part, or one that has given up its turn and does not sleep yet.
bool TurnClock::othersRun() {
  return std::ranges::any_of(threadsOfProcess(), [me = ::gettid()](pid_t thread) {
    return thread != me && lookAt(thread) == ThreadState::Running;
  });
}

void TurnClock::sendAway(Lock& lock, Participant& blocked) {
  blocked.state = Participant::State::Away;
  blocked.cpuBefore.reset();
  blocked.pollsSince = {};
  holder = nullptr;
  passOn(lock);
}

void TurnClock::callOutside(Lock& lock, Participant& blocked) {
  blocked.isOutside = true;
  if (!pace.isStarted()) pace.start(time);
  const std::string name = blocked.name;
  const pid_t thread = blocked.thread;
  const uint64_t turn = turns;
  lock.unlock();
  if (tellBlocked) tellBlocked(name, thread);
  lock.lock();
  if (holder != nullptr && turns == turn) sendAway(lock, *holder);
}

void TurnClock::takeBack(Participant& me) {
  me.isOutside = false;
  loosenPace();
}

void TurnClock::loosenPace() {
  if (!pace.isStarted() || speed == Speed::Real) return;
  if (std::ranges::any_of(participants, &Participant::isOutside)) return;
  pace.stop();
  keeperWakes.notify_one();  // it may sleep until real time has come so far
}

}  // namespace brimol::pc
