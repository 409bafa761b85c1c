#include "value_lines.h"

#include "language/language.h"
#include "plan/judge.h"
#include "results/measure_text.h"

namespace factory_test {

namespace {

std::string limitsIn(const Measure& measure) {
  if (measure.least && measure.most) {
    return numberText(*measure.least) + tr(" to ") + numberText(*measure.most);
  }
  if (measure.least) return tr("at least ") + numberText(*measure.least);
  return measure.most ? tr("at most ") + numberText(*measure.most) : "";
}

// As measureText().
std::string lineOf(const Measure& measure) {
  std::string line = std::string(tr(measure.name.c_str())) + ": " + numberText(measure.value);
  if (!measure.unit.empty()) line.append(" ").append(tr(measure.unit.c_str()));
  const std::string limits = limitsIn(measure);
  return limits.empty() ? line : line + " (" + limits + ")";
}

}  // namespace

std::vector<ValueLine> valueLines(std::vector<Measure> values, const PlanStep& step) {
  judge(Verdict::Pass, values, step);
  std::vector<ValueLine> lines;
  lines.reserve(values.size());
  for (const Measure& each : values) {
    lines.push_back({lineOf(each), {}});
    if (each.least || each.most) lines.back().isWithin = each.isWithin();
  }
  return lines;
}

}  // namespace factory_test
