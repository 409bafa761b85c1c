#include "input/input_service.h"

#include <chrono>
#include <utility>

namespace brimol::pc {

namespace {

InputService& gService = *new InputService;

}  // namespace

InputService& inputService() { return gService; }

void InputService::open() {
  const std::lock_guard lock(mutex);
  isOpen = true;
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
    if (!firstArrival) firstArrival = std::chrono::steady_clock::now();
  }
  wake.notify_all();
}

bool InputService::poll(Event& record) {
  const std::lock_guard lock(mutex);
  poller = std::this_thread::get_id();
  return queue.take(record);
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

void InputService::delay(uint32_t ms) {
  const auto end = std::chrono::steady_clock::now() + std::chrono::milliseconds(ms);
  std::unique_lock lock(mutex);
  const uint32_t started = clock.now();
  const uint32_t handAtStart = handChanges;
  const bool isPoller = poller == std::this_thread::get_id();
  const auto isOver = [&] {
    if (handChanges != handAtStart) return true;
    if (isPoller && !queue.isEmpty()) return true;
    return clock.isByHand() && clock.now() - started >= ms;
  };
  if (clock.isByHand()) {
    wake.wait(lock, isOver);
  } else {
    wake.wait_until(lock, end, isOver);
  }
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
  const std::lock_guard lock(watcherMutex);
  if (timeWatcher) timeWatcher();
}

}  // namespace brimol::pc
