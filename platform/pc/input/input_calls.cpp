// The C calls of the input service that need no screen.
#include <brimol/input.h>

#include "clock/process_clock.h"
#include "clock/turn_clock.h"
#include "input/input_service.h"

using brimol::pc::inputService;
using brimol::pc::turnClock;

int PollEvent(Event* event) {
  if (event == nullptr) return 0;
  if (auto* const clock = turnClock()) clock->takePartAsPoller();
  return inputService().poll(*event) ? 1 : 0;
}

unsigned int GetTicks() {
  auto* const clock = turnClock();
  return clock != nullptr ? clock->ticks() : inputService().now();
}

void Delay(unsigned int ms) {
  auto* const clock = turnClock();
  clock != nullptr ? clock->delay(ms) : inputService().delay(ms);
}
