#include "standing.h"

#include <algorithm>
#include <array>
#include <cstdio>

#include "language/language.h"

namespace factory_test {

namespace {

constexpr std::size_t kMostBytes = 200;

// An operator may repeat a test more often than the plan does by itself.
std::string attemptWords(int attempt, int planned) {
  std::array<char, kMostBytes> words = {};
  if (attempt <= planned) {
    std::snprintf(words.data(), words.size(), tr("Attempt %d of %d"), attempt, planned);
  } else {
    std::snprintf(words.data(), words.size(), tr("Attempt %d"), attempt);
  }
  return words.data();
}

std::string timeWords(int timeout, uint32_t milliseconds) {
  constexpr uint32_t kSecond = 1000;
  const int left = std::max(timeout - static_cast<int>(milliseconds / kSecond), 0);
  std::array<char, kMostBytes> words = {};
  std::snprintf(words.data(), words.size(), tr("Time left: %d s"), left);
  return words.data();
}

}  // namespace

std::string standingOf(const PlanStep& step, int attempt, uint32_t milliseconds) {
  std::string words = attempt > 1 ? attemptWords(attempt, step.retries + 1) : "";
  if (step.timeout == 0) return words;
  if (!words.empty()) words += " \u00B7 ";
  return words + timeWords(step.timeout, milliseconds);
}

}  // namespace factory_test
