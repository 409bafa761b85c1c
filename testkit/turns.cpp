#include <brimol3_widget_test/failure.h>
#include <brimol3_widget_test/platform.h>
#include <brimol3_widget_test/turns.h>

#include <chrono>
#include <vector>

namespace brimol::test {

namespace {

constexpr std::chrono::seconds kPatience{60};  // of real time

// Tells the platform of the thread's end, once the thread has had a turn.
struct Presence {
  bool hasTurn = false;
  Presence() = default;
  Presence(const Presence&) = delete;
  Presence& operator=(const Presence&) = delete;
  ~Presence() {
    if (hasTurn) platform().turns.end();
  }
};
thread_local Presence presence;

bool isOverAt(unsigned int now, unsigned int until) { return static_cast<int>(now - until) >= 0; }

}  // namespace

void Turns::hold() {
  const std::lock_guard guard(lock);
  holds = true;
}

void Turns::letGo() {
  const std::lock_guard guard(lock);
  holds = false;
  changed.notify_all();
}

void Turns::await(std::size_t threads) {
  std::unique_lock guard(lock);
  if (changed.wait_for(guard, kPatience, [&] { return held.size() >= threads; })) return;
  throw Failure(Here::now(), "of " + std::to_string(threads) + " threads " +
                                 std::to_string(held.size()) + " have come to a pause");
}

void Turns::give(unsigned int now) {
  std::unique_lock guard(lock);
  std::vector<Pause*> over;
  for (Pause* const pause : held) {
    if (pause->isShort || isOverAt(now, pause->until)) over.push_back(pause);
  }
  for (Pause* const pause : over) giveOne(*pause, guard);
}

void Turns::giveOne(Pause& pause, std::unique_lock<std::mutex>& guard) {
  isAway = true;
  pause.isOver = true;
  changed.notify_all();
  if (changed.wait_for(guard, kPatience, [this] { return !isAway; })) return;
  isAway = false;
  throw Failure(Here::now(), "a handler or a thread does not come back to its next pause");
}

bool Turns::pause(unsigned int now, unsigned int ms) {
  std::unique_lock guard(lock);
  if (presence.hasTurn) isAway = false;
  presence.hasTurn = false;
  changed.notify_all();
  if (!holds) return false;
  Pause mine{now + ms, ms <= 1};
  held.push_back(&mine);
  changed.wait(guard, [&] { return mine.isOver || !holds; });
  held.remove(&mine);
  presence.hasTurn = mine.isOver;
  return true;
}

void Turns::end() {
  const std::lock_guard guard(lock);
  isAway = false;
  changed.notify_all();
}

}  // namespace brimol::test
