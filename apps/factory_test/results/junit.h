/// The results as a report for a CI system.
#pragma once

#include <filesystem>
#include <span>
#include <string>

#include "results/test_result.h"

namespace factory_test {

/// JUnit XML in UTF-8: one suite with a case for each result, in their order. FAIL is a failure, no
/// verdict is a skipped case. A case's start time and screen size are its properties. Characters
/// that XML cannot hold become U+FFFD.
std::string junitXml(std::span<const TestResult> results);

/// Writes junitXml() to `path`, whole or not at all. False: the earlier file is as it was, and
/// `error` says in one line why. Waits for the disk.
bool writeJunit(const std::filesystem::path& path, std::span<const TestResult> results,
                std::string& error);

}  // namespace factory_test
