/// What pages need of the program around them.
#pragma once

#include <optional>
#include <string>

#include "plan/plan.h"
#include "results/results.h"
#include "session_log.h"

namespace factory_test {

/// Everything lives as long as the program; used on the main thread, the log on any.
struct Context {
  const ResultBook& results;
  SessionLog& log;
  std::optional<std::string> logText;  // what the log viewer shows; none: the program's own log
  std::string shellCommand;            // for /bin/sh
  const Plan& plan;
};

/// What the plan says of a test, or what is usual for one that is not in it.
inline PlanStep stepOf(const Context& program, std::string_view test) {
  const PlanStep* const step = program.plan.find(test);
  return step != nullptr ? *step : usualStep(test);
}

}  // namespace factory_test
