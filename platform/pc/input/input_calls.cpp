// The C calls of the input service that need no screen.
#include <brimol/input.h>

#include "input/input_service.h"

using brimol::pc::inputService;

int PollEvent(Event* event) {
  if (event == nullptr) return 0;
  return inputService().poll(*event) ? 1 : 0;
}

unsigned int GetTicks() { return inputService().now(); }

void Delay(unsigned int ms) { inputService().delay(ms); }
