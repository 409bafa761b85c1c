#include "value_lines.h"

#include <algorithm>
#include <cmath>

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

// As measureText(); with a dash for what was not measured yet.
std::string lineOf(const Measure& measure) {
  const bool isMeasured = !std::isnan(measure.value);
  std::string line = std::string(tr(measure.name.c_str())) + ": ";
  line += isMeasured ? numberText(measure.value) : "-";
  if (!measure.unit.empty()) line.append(" ").append(tr(measure.unit.c_str()));
  const std::string limits = limitsIn(measure);
  return limits.empty() ? line : line + " (" + limits + ")";
}

}  // namespace

std::vector<std::string> valueLines(std::vector<Measure> values, const PlanStep& step) {
  const auto isIn = [&values](const std::string& name) {
    return std::ranges::find(values, name, &Measure::name) != values.end();
  };
  for (const auto& [name, limits] : step.limits) {
    if (isIn(name)) continue;
    values.push_back(measured(step.test, name, 0));
    values.back().value = kNotMeasured;
  }
  judge(Verdict::Pass, values, step);
  std::vector<std::string> lines;
  lines.reserve(values.size());
  for (const ValueKind& kind : testKind(step.test).values) {
    const auto found = std::ranges::find(values, kind.name, &Measure::name);
    if (found != values.end()) lines.push_back(lineOf(*found));
  }
  return lines;
}

}  // namespace factory_test
