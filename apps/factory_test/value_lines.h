/// Measured values in the operator's language.
#pragma once

#include <string>
#include <vector>

#include "plan/plan.h"
#include "results/test_result.h"

namespace factory_test {

/// "worst distance: 3.5 mm (at most 5)": a line for each value, with the limits that the step gives
/// it.
std::vector<std::string> valueLines(std::vector<Measure> values, const PlanStep& step);

}  // namespace factory_test
