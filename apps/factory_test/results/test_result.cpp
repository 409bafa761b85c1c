#include "results/test_result.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace factory_test {

namespace {

using std::chrono::milliseconds;
using std::chrono::sys_days;
using std::chrono::sys_seconds;

constexpr sys_seconds kLastSecond =
    sys_days(std::chrono::year(9999) / 12 / 31) + std::chrono::days(1) - std::chrono::seconds(1);
constexpr milliseconds kLongestDuration(std::numeric_limits<int>::max());

}  // namespace

const char* verdictName(Verdict verdict) {
  switch (verdict) {
    case Verdict::Pass: return "PASS";
    case Verdict::Fail: return "FAIL";
    default: return "none";
  }
}

const char* reasonName(Reason reason) {
  switch (reason) {
    case Reason::Operator: return "operator";
    case Reason::Limit: return "limit";
    case Reason::TimeOut: return "time-out";
    case Reason::Rehearsal: return "rehearsal";
    case Reason::Retry: return "retry";
    default: return "";
  }
}

TestResult clamped(TestResult result) {
  result.started = std::clamp(result.started, sys_seconds(), kLastSecond);
  result.duration = std::clamp(result.duration, milliseconds(0), kLongestDuration);
  result.screen = {std::max(result.screen.width, 0), std::max(result.screen.height, 0)};
  std::erase_if(result.values, [](const Measure& each) { return !std::isfinite(each.value); });
  result.attempt = std::max(result.attempt, 1);
  return result;
}

}  // namespace factory_test
