#include "plan/plan.h"

#include <algorithm>
#include <cassert>

namespace factory_test {

double PlanStep::parameter(std::string_view name) const {
  const auto said = parameters.find(std::string(name));
  if (said != parameters.end()) return said->second;
  const auto kinds = testKind(test).parameters;
  const auto kind = std::ranges::find(kinds, name, &ParameterKind::name);
  assert(kind != kinds.end());
  return kind->usual;
}

const PlanStep* Plan::find(std::string_view test) const {
  const auto found = std::ranges::find(steps, test, &PlanStep::test);
  return found == steps.end() ? nullptr : &*found;
}

PlanStep usualStep(std::string_view test, const std::map<std::string, double>& parameters) {
  const TestKind& kind = testKind(test);
  PlanStep step = {.test = std::string(test), .parameters = parameters};
  for (const ParameterKind& parameter : kind.parameters) {
    step.parameters.emplace(parameter.name, parameter.usual);
  }
  for (const ValueKind& value : kind.values) {
    Limits limits = value.usual;
    if (!value.leastOf.empty()) limits.least = step.parameter(value.leastOf);
    if (limits.least || limits.most) step.limits.emplace(value.name, limits);
  }
  if (kind.asksForKeys) step.keys.assign(keyNames().begin(), keyNames().end());
  step.timeout = kind.timeout;
  return step;
}

Plan defaultPlan(const std::vector<KnownTest>& known) {
  Plan plan = {.name = "Default"};
  for (const KnownTest& test : known) {
    if (test.isUsual) plan.steps.push_back(usualStep(test.id));
  }
  return plan;
}

}  // namespace factory_test
