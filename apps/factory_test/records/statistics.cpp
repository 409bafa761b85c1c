#include "records/statistics.h"

#include <algorithm>
#include <cmath>
#include <numeric>
#include <set>
#include <utility>

#include "results/utc_time.h"

namespace factory_test {

namespace {

constexpr std::size_t kDayLetters = 10;  // of "2026-11-21T07:00:00Z"

// A test that failed, or that the operator began anew.
bool hasSecondTry(const RunRecord& run) {
  return std::ranges::any_of(run.verdicts, [](const VerdictRecord& each) {
    return each.result.verdict == Verdict::Fail || each.result.reason == Reason::Retry;
  });
}

// Of all its tests the newest verdict is PASS, and no test of the plan is without one.
bool isPassed(const RunRecord& run) {
  std::map<std::string, Verdict> newest;
  for (const std::string& test : run.start.tests) newest[test] = Verdict::None;
  for (const auto& [id, result] : run.verdicts) newest[result.test] = result.verdict;
  return std::ranges::all_of(newest, [](const auto& each) { return each.second == Verdict::Pass; });
}

// The runs of a unit.
struct Unit {
  const RunRecord* finished = nullptr;  // the newest
  bool hadSecondTry = false;
};

std::vector<Unit> unitsOf(std::span<const RunRecord> runs) {
  std::map<std::string, Unit> units;
  for (const RunRecord& run : runs) {
    const bool isKnown = !run.start.unit.empty();
    Unit& unit = units[isKnown ? "unit " + run.start.unit : "run " + run.id];
    if (run.state == RunState::Finished) unit.finished = &run;
    unit.hadSecondTry = unit.hadSecondTry || hasSecondTry(run);
  }
  std::vector<Unit> judged;
  for (const auto& [name, unit] : units) {
    if (unit.finished != nullptr) judged.push_back(unit);
  }
  return judged;
}

void countUnits(std::span<const RunRecord> runs, Statistics& all) {
  for (const auto& [run, hadSecondTry] : unitsOf(runs)) {
    const bool isGood = isPassed(*run);
    const Yield one = {1, isGood ? 1 : 0, isGood && !hadSecondTry ? 1 : 0};
    all.total.add(one);
    all.days[utcText(run->start.started).substr(0, kDayLetters)].add(one);
    all.stations[run->start.station].add(one);
  }
}

void countTests(std::span<const RunRecord> runs, Statistics& all) {
  std::map<std::string, TestCount> counts;
  for (const RunRecord& run : runs) {
    for (const auto& [id, result] : run.verdicts) {
      TestCount& count = counts[result.test];
      count.test = result.test;
      count.verdicts += result.verdict == Verdict::None ? 0 : 1;
      count.fails += result.verdict == Verdict::Fail ? 1 : 0;
    }
  }
  for (auto& [test, count] : counts) all.tests.push_back(std::move(count));
  std::ranges::stable_sort(all.tests, std::greater(), &TestCount::fails);
}

using SeriesByName = std::map<std::pair<std::string, std::string>, ValueSeries>;

void addValues(const TestResult& result, SeriesByName& series) {
  for (const Measure& each : result.values) {
    ValueSeries& one = series[{result.test, each.name}];
    one.test = result.test;
    one.newest = each;
    one.points.push_back({result.started, each.value, each.isWithin()});
  }
}

void collectValues(std::span<const RunRecord> runs, Statistics& all) {
  SeriesByName series;
  for (const RunRecord& run : runs) {
    for (const auto& [id, result] : run.verdicts) addValues(result, series);
  }
  for (auto& [key, one] : series) {
    std::ranges::stable_sort(one.points, {}, &ValuePoint::time);
    all.values.push_back(std::move(one));
  }
}

double deviationOf(const std::vector<double>& values, double mean) {
  double sum = 0;
  for (const double value : values) sum += (value - mean) * (value - mean);
  return values.size() < 2 ? 0 : std::sqrt(sum / static_cast<double>(values.size() - 1));
}

std::optional<double> capabilityOf(const Measure& limits, double mean, double deviation) {
  constexpr double kSigmas = 3;
  if (!(deviation > 0) || !std::isfinite(deviation) || (!limits.least && !limits.most)) return {};
  const double below = limits.least ? mean - *limits.least : HUGE_VAL;
  const double above = limits.most ? *limits.most - mean : HUGE_VAL;
  return std::min(below, above) / (kSigmas * deviation);
}

}  // namespace

void Yield::add(const Yield& other) {
  units += other.units;
  passed += other.passed;
  passedAtFirst += other.passedAtFirst;
}

Statistics statisticsOf(std::vector<RunRecord> runs) {
  Statistics all;
  all.rehearsals = static_cast<int>(std::erase_if(
      runs, [](const RunRecord& run) { return run.start.planName.ends_with(kRehearsal); }));
  all.runs = static_cast<int>(runs.size());
  all.aborted = static_cast<int>(std::ranges::count(runs, RunState::Aborted, &RunRecord::state));
  countUnits(runs, all);
  countTests(runs, all);
  collectValues(runs, all);
  return all;
}

Spread spreadOf(const ValueSeries& series) {
  std::vector<double> values;
  for (const ValuePoint& each : series.points) values.push_back(each.value);
  std::ranges::sort(values);
  const std::size_t middle = values.size() / 2;
  Spread spread = {values.front(), values.back()};
  // Step by step, which keeps equal values as they are.
  double count = 0;
  for (const double value : values) spread.mean += (value - spread.mean) / ++count;
  spread.median =
      values.size() % 2 == 1 ? values[middle] : std::midpoint(values[middle - 1], values[middle]);
  spread.deviation = deviationOf(values, spread.mean);
  spread.outside =
      static_cast<int>(std::ranges::count(series.points, false, &ValuePoint::isWithin));
  spread.capability = capabilityOf(series.newest, spread.mean, spread.deviation);
  return spread;
}

}  // namespace factory_test
