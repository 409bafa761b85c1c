/// How an attempt stands in the plan, in words for the operator.
#pragma once

#include <cstdint>
#include <string>

#include "plan/plan.h"

namespace factory_test {

/// Which attempt it is, from 1, from the second one on, and the time that is left after so many
/// milliseconds where the step has a time-out; else empty.
std::string standingOf(const PlanStep& step, int attempt, uint32_t milliseconds);

}  // namespace factory_test
