/// Measured values as people read them.
#pragma once

#include <string>

#include "results/test_result.h"

namespace factory_test {

/// The shortest decimal number that reads as `number` again: "0.1", "12000", "1e-09".
std::string numberText(double number);

/// "3.5 mm (at most 2)", "12 (10 to 20)", "8".
std::string measureText(const Measure& measure);

/// "at most 2", "at least 8", "10 to 20"; empty: no limits.
std::string limitsText(const Measure& measure);

}  // namespace factory_test
