/// The values of a test as its screens show them, in the chosen language.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "plan/plan.h"

namespace factory_test {

struct ValueLine {
  std::string words;
  std::optional<bool> isWithin;  // its limits, where it has any
};

/// A line for each value, in the catalogue's order, with the step's limits. One that has limits
/// and is not measured has a line, too.
std::vector<ValueLine> valueLines(std::vector<Measure> values, const PlanStep& step);

}  // namespace factory_test
