/// The factory test's main loop.
#pragma once

#include "options.h"

namespace factory_test {

/// Opens the screen, runs until it is ended (the end button, the window's close button, SIGINT or
/// SIGTERM) and closes everything again. Returns the program's exit code: 0, or 1 with one line on
/// stderr that says what went wrong. Call it on the main thread.
int runApplication(const Options& options);

}  // namespace factory_test
