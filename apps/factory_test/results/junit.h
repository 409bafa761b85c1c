/// The results as a report for a CI system.
#pragma once

#include <span>
#include <string>
#include <string_view>

#include "records/run.h"
#include "results/test_result.h"

namespace factory_test {

/// One suite: a run of a plan, and what became of its tests.
struct JunitSuite {
  std::string name = "factory_test";
  RunStart run = {};
  std::span<const TestResult> results = {};
};

/// JUnit XML in UTF-8: a case for each test of the plan, in their order, and one for each other
/// result behind them. What is known of the run, such as its plan's name and hash, stands in the
/// suite's properties. FAIL is a failure, no verdict or none yet is a skipped case. A case's start
/// time, screen size, attempt and values are its properties. Characters that XML cannot hold become
/// U+FFFD.
std::string junitXml(std::span<const JunitSuite> suites);

/// Whether a file that begins so is a report like these, whoever wrote it, or blank: one that may
/// be written over.
bool isJunitHead(std::string_view head);

}  // namespace factory_test
