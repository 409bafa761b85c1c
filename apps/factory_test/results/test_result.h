/// What a finished test leaves behind.
#pragma once

#include <array>
#include <chrono>
#include <optional>
#include <string>
#include <vector>

#include "screen_size.h"

namespace factory_test {

enum class Verdict { None, Pass, Fail };

/// The word of the files for it: "PASS", "FAIL" or "none".
const char* verdictName(Verdict verdict);

/// Why a test failed: the operator said so, a value was outside its limits or missing, its time was
/// over, or the failure was rehearsed. Retry is why it has no verdict: the operator began it anew.
/// Unknown for every other verdict, and for results of older programs.
enum class Reason { Unknown, Operator, Limit, TimeOut, Rehearsal, Retry };

/// All of them.
inline constexpr std::array kReasons = {Reason::Unknown, Reason::Operator,  Reason::Limit,
                                        Reason::TimeOut, Reason::Rehearsal, Reason::Retry};

/// The word of the files for it: "operator", "limit", "time-out", "rehearsal" or "retry"; empty for
/// Unknown.
const char* reasonName(Reason reason);

/// A value that a test delivered.
struct Measure {
  std::string name = {};             // "cells missed"; [a-z0-9 ], the key of limits and history
  std::string unit = {};             // "mm", "ms", "1/s"; empty for a count
  double value = 0;                  // finite
  std::optional<double> least = {};  // the limits that it was judged by; none: no limit
  std::optional<double> most = {};

  bool isWithin() const { return (!least || value >= *least) && (!most || value <= *most); }
  bool operator==(const Measure&) const = default;
};

struct TestResult {
  std::string test = {};  // its name, the key; UTF-8
  Verdict verdict = Verdict::None;
  std::chrono::sys_seconds started = {};    // UTC, years 1970 to 9999
  std::chrono::milliseconds duration = {};  // 0 to INT_MAX, that is 24 days
  ScreenSize screen = {};
  std::vector<Measure> values = {};
  int attempt = 1;  // 1 or more
  Reason reason = Reason::Unknown;
  std::string operatorName = {};  // who gave the verdict; empty: unknown

  bool operator==(const TestResult&) const = default;
};

/// The nearest result whose figures are within their ranges.
TestResult clamped(TestResult result);

}  // namespace factory_test
