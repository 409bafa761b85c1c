#include "clock/turn_clock.h"

#include <pthread.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <utility>

#include "clock/participant.h"
#include "clock/thread_look.h"

namespace brimol::pc {

namespace {

// So many calls without a pause are a loop that waits for the time to move.
constexpr int kMostCalls = 10'000;

std::atomic<uint64_t> lastId = 0;

std::string nameOfThread() {
  constexpr std::size_t kNameBytes = 16;
  std::array<char, kNameBytes> name = {};
  return pthread_getname_np(pthread_self(), name.data(), name.size()) == 0 ? name.data() : "";
}

// Where the calling thread sits. Nothing destroys it: what the thread destroys last may take part.
struct Seat {
  TurnClock* clock = nullptr;
  uint64_t id = 0;
  TurnClock::Participant* place = nullptr;
  bool endsWithThread = false;
};
constinit thread_local Seat seat;

// The main thread keeps the turn when it ends: the process does too.
struct Leaver {
  ~Leaver() {
    if (seat.clock != nullptr && ::gettid() != ::getpid()) seat.clock->leave();
  }
};

void leaveAtEndOfThread() {
  if (std::exchange(seat.endsWithThread, true)) return;
  thread_local const Leaver leaver;
}

}  // namespace

TurnClock::TurnClock(uint32_t firstTicks, Speed wantedSpeed)
    : id(++lastId), firstTick(firstTicks), speed(wantedSpeed) {
  if (speed == Speed::Real) pace.start(0);
  keeper = std::thread([this] { keep(); });
}

// The lock orders this behind a look at the agent that the keeper has begun and does not sleep
// after yet.
void TurnClock::lookAtAgent() {
  const std::lock_guard lock(mutex);
  keeperWakes.notify_one();
}

TurnClock::~TurnClock() {
  {
    const std::lock_guard lock(mutex);
    isOver = true;
  }
  keeperWakes.notify_one();
  keeper.join();
  if (seat.id == id) {
    seat.clock = nullptr;
    seat.id = 0;
  }
  cpus.leave();
}

TurnClock::Participant& TurnClock::add(const std::string& name) {
  Participant& added = participants.emplace_back();
  added.name = name;
  added.wake = time;
  return added;
}

// A place that the thread left goes now, and not with the thread's end, which may wait for a turn.
void TurnClock::sitDown(Participant& me) {
  leaveAtEndOfThread();
  drop([thread = ::gettid()](const Participant& each) {
    return each.state == Participant::State::Left && each.thread == thread;
  });
  seat.clock = this;
  seat.id = id;
  seat.place = &me;
  me.thread = ::gettid();
  if (speed == Speed::Free) cpus.join();
}

void TurnClock::drop(const std::function<bool(const Participant&)>& isToGo) {
  if (participants.remove_if(isToGo) > 0) loosenPace();
}

TurnClock::Participant& TurnClock::self() {
  if (seat.id == id) return *seat.place;
  const std::lock_guard lock(mutex);
  Participant& me = add(nameOfThread());
  me.state = Participant::State::Away;  // on its way to wait for its turn
  sitDown(me);
  return me;
}

void TurnClock::takePart() {
  Participant& me = self();
  if (holder == &me) {
    if (++me.calls >= kMostCalls) delay(1);
    return;
  }
  pause(me, 0);
}

// A thread that is away and waits for the lock looks blocked, and yet is on its way.
TurnClock::Lock TurnClock::lockFor(Participant& me) {
  me.arrives = true;
  Lock lock(mutex);
  me.arrives = false;
  return lock;
}

void TurnClock::takePartAsPoller() {
  takePart();
  Participant& me = self();
  if (me.isPoller) return;
  const Lock lock = lockFor(me);
  for (Participant& each : participants) each.isPoller = &each == &me;
}

uint32_t TurnClock::ticks() {
  takePart();
  return ticksNow();
}

void TurnClock::delay(uint32_t ms) { pause(self(), std::max(ms, 1U)); }

bool TurnClock::setWaitsInside(bool waits) { return self().waitsInside.exchange(waits); }

void TurnClock::wakePoller() {
  const std::lock_guard lock(mutex);
  for (Participant& each : participants) {
    if (each.isPoller) each.wake = std::min(each.wake, time.load());
  }
}

TurnClock::Participant& TurnClock::announce(const char* name) {
  takePart();
  const std::lock_guard lock(mutex);
  return add(name == nullptr ? "" : name);
}

void TurnClock::withdraw(Participant& announced) {
  const std::lock_guard lock(mutex);
  drop([&](const Participant& each) { return &each == &announced; });
  if (holder != &announced) return;
  holder = nullptr;
  keeperWakes.notify_one();
}

void TurnClock::begin(Participant& announced) {
  {
    const Lock lock(mutex);
    sitDown(announced);
  }
  hearOfTurn(announced);
}

void TurnClock::leave() {
  if (seat.id != id) return;
  Participant& me = *seat.place;
  seat.clock = nullptr;
  seat.id = 0;
  const Lock lock = lockFor(me);
  me.state = Participant::State::Left;
  if (holder == &me) holder = nullptr;
  keeperWakes.notify_one();
}

void TurnClock::pause(Participant& me, uint32_t ms) {
  Lock lock = lockFor(me);
  me.calls = 0;
  me.wake = endOfPause(ms);
  me.isAtWork = false;
  me.state = Participant::State::Waiting;
  me.polls = false;
  if (me.isOutside) takeBack(me);
  if (holder == &me) holder = nullptr;
  if (holder == nullptr) passOn(lock);
  lock.unlock();
  hearOfTurn(me);
}

uint64_t TurnClock::endOfPause(uint32_t ms) const {
  return ms == 0 ? time.load() : (time + ms + step - 1) / step * step;
}

void TurnClock::hearOfTurn(Participant& me) {
  me.granted.wait();
  me.isAtWork = true;
}

// Nobody has the turn.
void TurnClock::passOn(Lock& lock) {
  if (isPassing) return;
  isPassing = true;
  Participant* const next = choose(lock);
  isPassing = false;
  if (next == nullptr) {
    keeperWakes.notify_one();
    return;
  }
  time = std::max(time.load(), next->wake);
  next->state = Participant::State::Running;
  holder = next;
  ++turns;
  next->granted.give();
}

// Null: nobody can run, or real time has not come so far; the keeper looks again.
TurnClock::Participant* TurnClock::choose(Lock& lock) {
  while (!isOver) {
    settle(lock);
    const std::optional<uint64_t> moment = nextMoment();
    if (!moment || !pace.isReached(*moment)) return nullptr;
    const std::optional<uint64_t> due = agentDue();
    Participant* const next = earliest();
    if (!due || *due > next->wake) return next;
    actAsAgent(lock, *due);
  }
  return nullptr;
}

TurnClock::Participant* TurnClock::earliest() {
  Participant* found = nullptr;
  for (Participant& each : participants) {
    if (each.state != Participant::State::Waiting) continue;
    if (found == nullptr || each.wake < found->wake) found = &each;
  }
  return found;
}

// Where the machine lags, real time has come further than the next turn's: what came from outside
// is due before that one. It would wait for as long as the machine lags otherwise.
std::optional<uint64_t> TurnClock::agentDue() {
  if (!agent.due) return std::nullopt;
  if (!pace.isStarted()) return agent.due(time + 1);
  const Participant* const next = earliest();
  const uint64_t come = next == nullptr ? pace.reached() : std::min(pace.reached(), next->wake);
  return agent.due(std::max(time + 1, come));
}

// None: every thread is away, and time stands still.
std::optional<uint64_t> TurnClock::nextMoment() {
  const Participant* const next = earliest();
  if (next == nullptr) return std::nullopt;
  const std::optional<uint64_t> due = agentDue();
  return due ? std::min(*due, next->wake) : next->wake;
}

void TurnClock::actAsAgent(Lock& lock, uint64_t due) {
  time = std::max(time.load(), due);
  lock.unlock();
  agent.act(time);
  lock.lock();
}

}  // namespace brimol::pc
