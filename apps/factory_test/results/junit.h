/// The results as a report for a CI system.
#pragma once

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "results/test_result.h"

namespace factory_test {

/// One suite: the tests of a plan, and what became of them.
struct JunitSuite {
  std::string name = "factory_test";
  std::vector<std::string> planned = {};  // in the plan's order; may be empty
  std::span<const TestResult> results = {};
};

/// JUnit XML in UTF-8: a case for each planned test, in their order, and one for each other result
/// behind them. FAIL is a failure, no verdict or none yet is a skipped case. A case's start time,
/// screen size, attempt and values are its properties. Characters that XML cannot hold become
/// U+FFFD.
std::string junitXml(std::span<const JunitSuite> suites);

/// Whether a file that begins so is a report like these, whoever wrote it, or blank: one that may
/// be written over.
bool isJunitHead(std::string_view head);

}  // namespace factory_test
