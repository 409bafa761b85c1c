#include "plan/judge.h"

#include <algorithm>

namespace factory_test {

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

}  // namespace factory_test
