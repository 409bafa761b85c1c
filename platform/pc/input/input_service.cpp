#include "input/input_service.h"

#include <algorithm>
#include <utility>

namespace brimol::pc {

namespace {

using std::chrono::milliseconds;
using std::chrono::steady_clock;

InputService& gService = *new InputService;

}  // namespace

InputService& inputService() { return gService; }

void InputService::open() {
  const std::lock_guard lock(mutex);
  isOpen = true;
  lastActivity = steady_clock::now();
  earlyEnds.reset();
}

void InputService::close() {
  {
    const std::lock_guard lock(mutex);
    isOpen = false;
    queue.clear();
  }
  letGo();
}

void InputService::post(const Event& record) { diversion ? diversion(record) : deliver(record); }

void InputService::deliver(const Event& record) {
  {
    const std::lock_guard lock(mutex);
    if (!isOpen) return;
    queue.push(record);
    lastActivity = steady_clock::now();
    if (!firstArrival) firstArrival = lastActivity;
  }
  wake.notify_all();
}

bool InputService::poll(Event& record) {
  const std::lock_guard lock(mutex);
  poller = std::this_thread::get_id();
  const bool isGiven = queue.take(record);
  earlyEnds.hearOfPoll(isGiven);
  return isGiven;
}

std::optional<std::chrono::steady_clock::time_point> InputService::takeFirstArrival() {
  const std::lock_guard lock(mutex);
  return std::exchange(firstArrival, std::nullopt);
}

uint32_t InputService::now() const {
  if (followed != nullptr) return followed->ticksNow();
  const std::lock_guard lock(mutex);
  return clock.now();
}

void InputService::hearOfFrame() {
  const std::lock_guard lock(mutex);
  lastActivity = steady_clock::now();
}

void InputService::delay(uint32_t ms) {
  Lock lock(mutex);
  if (clock.isByHand()) {
    pauseByHand(lock, ms);
  } else if (poller == std::this_thread::get_id()) {
    pausePoller(lock, endOf(steady_clock::now(), ms));
  } else {
    pauseOther(lock, ms, endOf(steady_clock::now(), ms));
  }
}

InputService::Time InputService::endOf(Time start, uint32_t ms) const {
  const bool isIdle = start - lastActivity >= kIdleAfter;
  return start + milliseconds(isIdle && ms == 1 ? kIdlePauseMs : ms);
}

steady_clock::time_point InputService::endOfPause(Time start, uint32_t ms) const {
  const std::lock_guard lock(mutex);
  return endOf(start, ms);
}

void InputService::pauseByHand(Lock& lock, uint32_t ms) {
  const uint32_t started = clock.now();
  const bool isPoller = poller == std::this_thread::get_id();
  wake.wait(lock, [&, handAtStart = handChanges] {
    return handChanges != handAtStart || clock.now() - started >= ms ||
           (isPoller && !queue.isEmpty());
  });
}

void InputService::pausePoller(Lock& lock, Time end) {
  wake.wait_until(lock, end, [&, handAtStart = handChanges] {
    return handChanges != handAtStart || !queue.isEmpty();
  });
}

void InputService::pauseOther(Lock& lock, uint32_t ms, Time end) {
  EarlyEnds::Pause pause(earlyEnds, ms);
  const auto handMoved = [&, handAtStart = handChanges] { return handChanges != handAtStart; };
  const Time soonest = std::min(end, steady_clock::now() + milliseconds(1));
  pause.wake().wait_until(lock, end, [&] { return handMoved() || pause.isOver(); });
  if (!pause.isOver()) return;
  if (pause.isBounded()) wake.wait_until(lock, soonest, handMoved);
  pause.endEarly();
}

void InputService::takeHand(uint32_t start) {
  {
    const std::lock_guard lock(mutex);
    clock.takeHand(start);
    ++handChanges;
  }
  tellTime();
}

void InputService::advance(uint32_t ms) {
  {
    const std::lock_guard lock(mutex);
    clock.advance(ms);
  }
  tellTime();
}

void InputService::letGo() {
  {
    const std::lock_guard lock(mutex);
    clock.letGo();
    ++handChanges;
  }
  tellTime();
}

void InputService::setTimeWatcher(std::function<void()> watcher) {
  const std::lock_guard lock(watcherMutex);
  timeWatcher = std::move(watcher);
}

void InputService::tellTime() {
  wake.notify_all();
  earlyEnds.wakeAll();
  const std::lock_guard lock(watcherMutex);
  if (timeWatcher) timeWatcher();
}

}  // namespace brimol::pc
