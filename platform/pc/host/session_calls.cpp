// EventInit and EventQuit: with its input the whole platform opens and closes.
#include <brimol/input.h>

#include <iostream>
#include <string>

#include "host/open_platform.h"

int EventInit(unsigned int /*flags*/) {
  const std::string error = brimol::pc::openPlatform();
  if (error.empty()) return 1;
  std::cerr << error << '\n';
  return 0;
}

void EventQuit() { brimol::pc::closePlatform(); }
