#include "run_progress.h"

#include <algorithm>
#include <array>
#include <cstdio>

#include "language/language.h"
#include "layout.h"

namespace factory_test {

std::string RunProgress::words() const {
  constexpr std::size_t kMost = 200;
  std::array<char, kMost> words = {};
  std::snprintf(words.data(), words.size(), tr("%d of %d done: %d PASS, %d FAIL"),
                static_cast<int>(done()), static_cast<int>(tests), static_cast<int>(passed),
                static_cast<int>(failed));
  return words.data();
}

std::string RunProgress::allWords() const {
  return whose.empty() ? words() : whose + "\n" + words();
}

namespace {

std::string whoseIs(const RunStart& run) {
  std::string words;
  const auto add = [&](const char* format, const std::string& name) {
    constexpr std::size_t kMost = 600;  // bytes: a storable name and some words
    std::array<char, kMost> part = {};
    std::snprintf(part.data(), part.size(), format, name.c_str());
    words.append(words.empty() ? "" : " \u00B7 ").append(part.data());
  };
  if (!run.unit.empty()) add(tr("Unit %s"), run.unit);
  if (!run.operatorName.empty()) add(tr("Operator %s"), run.operatorName);
  if (run.planName.ends_with(kRehearsal)) add("%s", tr("REHEARSAL"));
  return words;
}

}  // namespace

RunProgress progressOf(const ResultBook& book) {
  RunProgress progress = {.whose = whoseIs(book.run())};
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
