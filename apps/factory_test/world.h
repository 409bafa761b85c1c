/// What the program asks of the world, through the host: a recorded run gets the same answers
/// again.
#pragma once

#include <chrono>

#include "machine_figures.h"

namespace factory_test {

std::chrono::sys_seconds presentTime();

/// Read anew; a figure that a played trace does not say reads "n/a".
MachineFigures presentFigures();

}  // namespace factory_test
