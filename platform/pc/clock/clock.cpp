#include "clock/clock.h"

#include <chrono>

namespace brimol::pc {

namespace {

uint32_t machineMs() {
  using std::chrono::duration_cast;
  using std::chrono::milliseconds;
  const auto sinceStart = std::chrono::steady_clock::now().time_since_epoch();
  return static_cast<uint32_t>(duration_cast<milliseconds>(sinceStart).count());
}

}  // namespace

uint32_t Clock::now() const { return byHand ? handTime : machineMs() + offset; }

void Clock::takeHand(uint32_t start) {
  byHand = true;
  handTime = start;
}

void Clock::advance(uint32_t ms) { handTime += ms; }

void Clock::letGo() {
  if (!byHand) return;
  byHand = false;
  offset = handTime - machineMs();
}

}  // namespace brimol::pc
