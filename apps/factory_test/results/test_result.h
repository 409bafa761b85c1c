/// What a finished test leaves behind.
#pragma once

#include <chrono>
#include <string>

namespace factory_test {

enum class Verdict { None, Pass, Fail };

/// The word of the files for it: "PASS", "FAIL" or "none".
const char* verdictName(Verdict verdict);

struct ScreenSize {
  int width = 0;  // pixels, 0 or more
  int height = 0;

  bool operator==(const ScreenSize&) const = default;
};

/// A whole year; no test takes as long.
constexpr std::chrono::milliseconds kLongestDuration = std::chrono::hours(24 * 365);

struct TestResult {
  std::string test = {};  // its name, the key; UTF-8
  Verdict verdict = Verdict::None;
  std::chrono::sys_seconds started = {};    // UTC, years 0 to 9999
  std::chrono::milliseconds duration = {};  // 0 to kLongestDuration
  ScreenSize screen = {};

  bool operator==(const TestResult&) const = default;
};

/// The nearest result that a file can hold: bytes that are no UTF-8 become U+FFFD, figures outside
/// their range its nearest end, an unknown verdict none.
TestResult storable(TestResult result);

}  // namespace factory_test
