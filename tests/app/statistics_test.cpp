#include "records/statistics.h"

#include <gtest/gtest.h>

#include <utility>

namespace factory_test {
namespace {

constexpr std::chrono::sys_seconds kMorning(std::chrono::seconds(1'795'244'400));

TestResult resultOf(const std::string& test, Verdict verdict) {
  return {.test = test,
          .verdict = verdict,
          .started = kMorning,
          .values = {{"worst distance", "mm", 0.1, {}, 2.5}}};
}
const TestResult kKeys = resultOf("keys", Verdict::Pass);
const TestResult kTouch = resultOf("touch", Verdict::Fail);

RunRecord runOf(const char* unit, RunState state, std::vector<TestResult> results) {
  RunRecord run = {.id = unit,
                   .start = {.unit = unit, .tests = {"keys", "touch"}, .started = kMorning},
                   .state = state};
  for (TestResult& each : results) run.verdicts.push_back({"", std::move(each)});
  return run;
}

std::vector<RunRecord> runsOfUnits() {
  const TestResult touched = resultOf("touch", Verdict::Pass);
  const TestResult anew = {.test = "touch", .reason = Reason::Retry};
  std::vector<RunRecord> runs = {
      runOf("at first", RunState::Finished, {kKeys, touched}),
      runOf("in the end", RunState::Finished, {kKeys, kTouch, touched}),
      runOf("tried anew", RunState::Finished,
            {anew, {kKeys.test, Verdict::Pass}, {"touch", Verdict::Pass}}),
      runOf("later", RunState::Aborted, {kTouch}),
      runOf("later", RunState::Finished, {kKeys, touched}),
      runOf("never", RunState::Finished, {kKeys, kTouch}),
      runOf("stopped", RunState::Finished, {kKeys}),
      runOf("unjudged", RunState::Aborted, {kKeys, touched}),
  };
  runs[0].verdicts[0].result.values[0].value = 9.5;
  runs[6].start.started += std::chrono::days(1);
  runs.push_back(runOf("rehearsed", RunState::Finished, {kKeys, kTouch}));
  runs.back().start.planName += kRehearsal;
  return runs;
}

TEST(Statistics, TellYieldFailsAndValues) {
  const Statistics all = statisticsOf(runsOfUnits());
  EXPECT_EQ(all.total.units, 6);
  EXPECT_EQ(all.total.passed, 4);
  EXPECT_EQ(all.total.passedAtFirst, 1);
  EXPECT_EQ(all.days.size(), 2U);
  EXPECT_EQ(all.aborted, 2);
  EXPECT_EQ(all.rehearsals, 1);
  ASSERT_EQ(all.tests.size(), 2U);
  EXPECT_EQ(all.tests[0].test, "touch");
  EXPECT_EQ(all.tests[0].fails, 3);
  ASSERT_EQ(all.values.size(), 2U);
  const Spread spread = spreadOf(all.values[0]);
  EXPECT_EQ(spread.outside, 1);
  EXPECT_EQ(spread.most, 9.5);
  EXPECT_EQ(spread.median, 0.1);
  EXPECT_NEAR(spread.deviation, 3.837, 0.001);
  EXPECT_NEAR(*spread.capability, (2.5 - spread.mean) / 3 / spread.deviation, 1e-9);
}

}  // namespace
}  // namespace factory_test
