#include "results/test_result.h"

#include <algorithm>

#include "results/utc_time.h"
#include "results/utf8.h"

namespace factory_test {

const char* verdictName(Verdict verdict) {
  switch (verdict) {
    case Verdict::Pass: return "PASS";
    case Verdict::Fail: return "FAIL";
    default: return "none";
  }
}

TestResult storable(TestResult result) {
  using std::chrono::milliseconds;
  result.test = validUtf8(result.test);
  if (result.verdict != Verdict::Pass && result.verdict != Verdict::Fail) {
    result.verdict = Verdict::None;
  }
  result.started = std::clamp(result.started, kFirstSecond, kLastSecond);
  result.duration = std::clamp(result.duration, milliseconds(0), kLongestDuration);
  result.screen = {std::max(result.screen.width, 0), std::max(result.screen.height, 0)};
  return result;
}

}  // namespace factory_test
