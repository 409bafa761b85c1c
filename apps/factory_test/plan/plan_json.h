/// Plans as text, in the layout of plan files.
#pragma once

#include <string>

#include "plan/plan.h"

namespace factory_test {

inline constexpr int kPlanVersion = 1;  // of the layout

/// The word of the files for it: "go_on", "stop" or "ask".
const char* onFailureName(OnFailure onFailure);

/// A file of the same plan, with every field.
std::string planJson(const Plan& plan);

/// SHA-256 of planJson(), in hexadecimal: equal plans have equal ones, however their files are
/// written.
std::string planHash(const Plan& plan);

}  // namespace factory_test
