#include "run_progress.h"

#include <algorithm>

#include "layout.h"

namespace factory_test {

std::string RunProgress::words() const {
  return std::to_string(done()) + " of " + std::to_string(tests) +
         " done: " + std::to_string(passed) + " PASS, " + std::to_string(failed) + " FAIL";
}

RunProgress progressOf(const ResultBook& book) {
  RunProgress progress;
  for (const std::string& test : book.run().tests) {
    const TestResult* const result = book.find(test);
    ++progress.tests;
    if (result == nullptr) continue;
    if (result->verdict == Verdict::Pass) ++progress.passed;
    if (result->verdict == Verdict::Fail) ++progress.failed;
  }
  return progress;
}

void drawProgress(const RunProgress& progress, const SKIA_Rect& area) {
  skia_add_box_c(inColor(area, kRowInk.ground));
  const auto upTo = [&](int count) {
    return static_cast<int>(int64_t{area.w} * count / std::max(progress.tests, 1));
  };
  const int passed = upTo(progress.passed);
  const int done = upTo(progress.done());
  if (passed > 0) skia_add_box_c({area.x, area.y, passed, area.h, kPassInk.ground});
  if (done > passed) {
    skia_add_box_c({area.x + passed, area.y, done - passed, area.h, kFailInk.ground});
  }
}

}  // namespace factory_test
