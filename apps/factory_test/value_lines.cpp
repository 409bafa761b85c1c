#include "value_lines.h"

#include <algorithm>

#include "language/language.h"
#include "plan/judge.h"
#include "results/measure_text.h"

namespace factory_test {

namespace {

std::string limitsIn(const Measure& measure) {
  if (measure.least && measure.most) {
    return filled(tr("%1 to %2"), {numberText(*measure.least), numberText(*measure.most)});
  }
  if (measure.least) return filled(tr("at least %1"), {numberText(*measure.least)});
  return measure.most ? filled(tr("at most %1"), {numberText(*measure.most)}) : "";
}

// As measureText().
std::string lineOf(const Measure& measure, const std::string& number) {
  std::string line = std::string(tr(measure.name.c_str())) + ": " + number;
  if (!measure.unit.empty()) line.append(" ").append(tr(measure.unit.c_str()));
  const std::string limits = limitsIn(measure);
  return limits.empty() ? line : line + " (" + limits + ")";
}

}  // namespace

std::vector<ValueLine> valueLines(std::vector<Measure> values, const PlanStep& step) {
  judge(Verdict::Pass, values, step);
  std::vector<ValueLine> lines;
  for (const ValueKind& kind : testKind(step.test).values) {
    const auto value = std::ranges::find(values, kind.name, &Measure::name);
    const auto limits = step.limits.find(std::string(kind.name));
    if (value != values.end()) {
      lines.push_back({lineOf(*value, numberText(value->value)), {}});
      if (value->least || value->most) lines.back().isWithin = value->isWithin();
    } else if (limits != step.limits.end()) {
      Measure missing = measured(step.test, kind.name, 0);
      missing.least = limits->second.least;
      missing.most = limits->second.most;
      lines.push_back({lineOf(missing, "-"), false});
    }
  }
  return lines;
}

}  // namespace factory_test
