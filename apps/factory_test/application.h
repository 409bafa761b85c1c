/// The factory test's main loop.
#pragma once

#include "exit_code.h"
#include "options.h"

namespace factory_test {

/// Opens the screen, runs until it is ended (the end button, the window's close button, SIGINT,
/// SIGTERM or SIGHUP, as far as they are not ignored) and closes everything again. The result of a
/// run whose screen or files cannot be used is ExitCode::Trouble, with one line on stderr that says
/// why. Call it on the main thread.
ExitCode runApplication(const Options& options);

}  // namespace factory_test
