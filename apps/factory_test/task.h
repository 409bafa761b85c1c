/// What the program was started for.
#pragma once

#include <optional>
#include <string>

#include "options.h"
#include "plan/plan.h"
#include "plan/simulation.h"

namespace factory_test {

struct Task {
  Plan plan;
  Simulation simulation;
  bool isOwnPlan;  // not the built-in one
  bool isRun;      // from the plan's first step to its last one, without the menu
};

/// What the options name. Nothing for a plan file that is wrong, or a simulation that does not fit
/// the plan; `error` then says so in one line. The plan of a rehearsal says that it is one in its
/// name, so that nobody takes its results for others.
std::optional<Task> chooseTask(const Options& options, std::string& error);

}  // namespace factory_test
