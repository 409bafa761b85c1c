/// Values against limits.
#pragma once

#include <vector>

#include "plan/plan.h"
#include "results/test_result.h"

namespace factory_test {

/// Gives each value the step's limits, and returns what the verdict becomes by them: a PASS with a
/// value outside its limits, or with one missing that has limits, is a FAIL. Other verdicts stay.
Verdict judge(Verdict given, std::vector<Measure>& values, const PlanStep& step);

}  // namespace factory_test
