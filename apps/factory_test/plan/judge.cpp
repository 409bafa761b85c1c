#include "plan/judge.h"

#include <algorithm>
#include <array>
#include <cstdio>

namespace factory_test {

namespace {

std::string shortNumber(double value) {
  constexpr int kRoom = 32;
  std::array<char, kRoom> words{};
  std::snprintf(words.data(), words.size(), "%.4g", value);
  return words.data();
}

}  // namespace

Verdict judge(Verdict given, std::vector<Measure>& values, const PlanStep& step) {
  bool isWithin = true;
  for (Measure& measure : values) {
    const auto limits = step.limits.find(measure.name);
    if (limits == step.limits.end()) continue;
    measure.least = limits->second.least;
    measure.most = limits->second.most;
    isWithin = isWithin && measure.isWithin();
  }
  const bool areAllThere = std::ranges::all_of(step.limits, [&](const auto& limits) {
    return std::ranges::find(values, limits.first, &Measure::name) != values.end();
  });
  return given == Verdict::Pass && !(isWithin && areAllThere) ? Verdict::Fail : given;
}

std::string wordsOf(const Measure& measure) {
  std::string words = measure.name + " " + shortNumber(measure.value);
  if (!measure.unit.empty()) words.append(" ").append(measure.unit);
  std::string limits;
  if (measure.least) limits = "at least " + shortNumber(*measure.least);
  if (measure.most) {
    limits.append(limits.empty() ? "" : ", ").append("at most " + shortNumber(*measure.most));
  }
  return limits.empty() ? words : words + " (" + limits + ")";
}

}  // namespace factory_test
