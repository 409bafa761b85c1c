/// Measured values in the operator's language.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "plan/plan.h"
#include "results/test_result.h"

namespace factory_test {

/// "worst distance: 3.5 mm (at most 5)".
struct ValueLine {
  std::string words;
  std::optional<bool> isWithin;  // its limits, where it has any
};

/// A line for each value, with the limits that the step gives it.
std::vector<ValueLine> valueLines(std::vector<Measure> values, const PlanStep& step);

}  // namespace factory_test
