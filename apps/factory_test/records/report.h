/// The page that `factory_test report` writes.
#pragma once

#include <string>

#include "records/statistics.h"

namespace factory_test {

/// Yield, first-pass yield, the tests that fail most, and distribution and trend of the values, as
/// a page that needs nothing else. `value`: only values of that name; empty: all.
std::string reportHtml(const Statistics& statistics, const std::string& value);

}  // namespace factory_test
