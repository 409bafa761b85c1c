#include <gtest/gtest.h>
#include <unistd.h>

#include <cstring>
#include <filesystem>
#include <fstream>

#include "plan/judge.h"
#include "plan/plan_json.h"
#include "plan/plan_reader.h"
#include "plan/plan_run.h"
#include "plan/simulation.h"

namespace factory_test {
namespace {

const std::vector<KnownTest> kKnown = {
    {"touch_grid", true}, {"keys", true}, {"shell", false}, {"pinch", false}};

// Goes with it.
struct PlanFile {
  PlanFile() = default;
  ~PlanFile() { std::filesystem::remove(name); }
  PlanFile(const PlanFile&) = delete;
  PlanFile& operator=(const PlanFile&) = delete;
  const std::string name = testing::TempDir() + "plan_test." + std::to_string(::getpid()) + ".json";
};

Plan threeSteps(OnFailure onFailure, int retries) {
  PlanStep second = {.test = "keys", .retries = retries, .onFailure = onFailure};
  return {.name = "three", .steps = {{.test = "touch_grid"}, second, {.test = "shell"}}};
}

struct WrongCase {
  const char* name;
  std::string text;
  int line;
  const char* what;
};

class WrongPlan : public testing::TestWithParam<WrongCase> {};

TEST_P(WrongPlan, IsRefusedWithItsLine) {
  Complaint complaint;
  EXPECT_FALSE(parsePlan(GetParam().text, kKnown, complaint));
  EXPECT_EQ(complaint.line, GetParam().line) << complaint.what;
  EXPECT_NE(complaint.what.find(GetParam().what), std::string::npos) << complaint.what;
}

INSTANTIATE_TEST_SUITE_P(
    All, WrongPlan,
    testing::Values(
        WrongCase{"number", "{\"version\":\n1,\n\"name\":\n\"x\",\n\"steps\":\n7\n}", 5, "'steps'"},
        WrongCase{"last_number", "\n{\"version\":2\n}", 2, "'version' is not 1"},
        WrongCase{"late_value",
                  "{\"version\":1,\"name\":\"x\",\"steps\":[\n{\"limits\":{\n\"keys seen\":{\n"
                  "\"most\":1e400}},\n\"test\":\"keys\"}]}",
                  4, "number overflow"},
        WrongCase{"other_test",
                  "{\"version\":1,\"name\":\"x\",\"steps\":[\n{\"limits\":{\n\"cells\":{\n"
                  "\"most\":1}},\n\"test\":\"keys\"}]}",
                  3, "'keys' has no value 'cells', it has: keys seen"},
        WrongCase{"cut", "{\n\n\"version\": 1,\n", 3, "is not JSON: "},
        WrongCase{"line_in_a_text", "{\n\"na\nme\": 1}", 2, "is not JSON: "},
        WrongCase{"missing", "\n{\n\"version\": 1}", 2, "has no 'name'"},
        WrongCase{"deep", std::string(200000, '['), 1, "nested too deep"},
        WrongCase{"bytes", "{\"version\":1,\n\"name\":\"\xff\"}", 2, "is not JSON: "},
        WrongCase{"nul", std::string("{\"version\":1,\n\0 \"name\"", 22), 2, "holds a NUL byte"},
        WrongCase{"control", "{\"name\":\"a\\u0007\"}", 1, "'name' has a control character"},
        WrongCase{"long_name", "{\"" + std::string(900'000, 'k') + "\":1}", 1, "kkk...'"},
        WrongCase{"twice",
                  "{\"version\":1,\"name\":\"x\",\"steps\":[{\"test\":\"keys\"},\n"
                  "{\"test\":\n\"keys\"}]}",
                  2, "the test 'keys' is there twice"}),
    [](const auto& shown) { return shown.param.name; });

TEST(Plans, ThatArePrintedAreReadAgain) {
  Plan plan = defaultPlan(kKnown);
  ASSERT_EQ(plan.steps.size(), 2);
  plan.steps[0] = {.test = "touch_grid",
                   .text = "Grün:\n\"alle\"",
                   .limits = {{"cells missed", {.least = {}, .most = 0.1}}},
                   .parameters = {{"cell mm", 4.7}},
                   .retries = 3,
                   .timeout = 90,
                   .onFailure = OnFailure::Ask};
  Complaint complaint;
  const auto read = parsePlan(planJson(plan), kKnown, complaint);
  ASSERT_TRUE(read) << complaint.what;
  EXPECT_EQ(*read, plan);
  EXPECT_EQ(planHash(*read), planHash(plan));
  plan.steps[0].limits["cells missed"].most = 0.2;
  EXPECT_NE(planHash(*read), planHash(plan));
}

TEST(Plans, TakeTheUsualLimitsWhereTheySayNone) {
  Complaint complaint;
  const auto plan = parsePlan(
      R"({"version":1,"name":"x","steps":[{"test":"touch_grid"},{"test":"keys","limits":{}},
          {"test":"pinch","parameters":{"fingers":7}}]})",
      kKnown, complaint);
  ASSERT_TRUE(plan) << complaint.what;
  EXPECT_EQ(plan->steps[0].limits.at("cells missed").most, 0);
  EXPECT_EQ(plan->steps[0].timeout, usualStep("touch_grid").timeout);
  EXPECT_TRUE(plan->steps[1].limits.empty());
  EXPECT_EQ(plan->steps[0].parameters, usualStep("touch_grid").parameters);
  EXPECT_EQ(plan->steps[1].keys, usualStep("keys").keys);
  EXPECT_EQ(plan->steps[2].limits.at("fingers counted").least, 7) << "as many as are asked for";
}

TEST(Plans, HaveTheHashOfTheirText) {
  const PlanFile written;
  const std::string& file = written.name;
  const Plan plan = {.name = "x", .steps = {{.test = "keys"}}};
  std::ofstream(file) << planJson(plan);
  FILE* const sum = popen(("sha256sum < " + file).c_str(), "r");
  ASSERT_NE(sum, nullptr);
  std::string line(64, ' ');
  EXPECT_EQ(std::fread(line.data(), 1, line.size(), sum), line.size());
  pclose(sum);
  EXPECT_EQ(planHash(plan), line);
}

TEST(Plans, AreReadFromSmallFilesOnly) {
  const PlanFile written;
  const std::string& file = written.name;
  const std::string text = planJson({.name = "x", .steps = {{.test = "keys"}}});
  std::string error;
  std::ofstream(file) << text;
  EXPECT_TRUE(readPlan(file, kKnown, error)) << error;
  std::ofstream(file) << text << std::string(1 << 20, ' ');
  EXPECT_FALSE(readPlan(file, kKnown, error));
  EXPECT_EQ(error.find(file), 0) << error;
  std::ofstream(file) << "{\n\"size\":1}";
  EXPECT_FALSE(readPlan(file, kKnown, error));
  EXPECT_EQ(error, file + ":2: the plan has the unknown field 'size'");
}

TEST(Judge, FailsAPassByItsValues) {
  const PlanStep step = {
      .test = "touch_lines",
      .limits = {{"lines followed", {.least = 2, .most = {}}}, {"worst distance", {0, 5}}}};
  const auto judged = [&step](Verdict given, std::vector<Measure> values) {
    return judge(given, values, step);
  };
  const Measure lines = measured("touch_lines", "lines followed", 2);
  const Measure near = measured("touch_lines", "worst distance", 5);
  const Measure far = measured("touch_lines", "worst distance", 5.01);
  EXPECT_EQ(judged(Verdict::Pass, {lines, near}), Verdict::Pass);
  EXPECT_EQ(judged(Verdict::Pass, {lines, far}), Verdict::Fail);
  EXPECT_EQ(judged(Verdict::Pass, {lines}), Verdict::Fail) << "a value is missing";
  EXPECT_EQ(judged(Verdict::Fail, {lines, near}), Verdict::Fail);
  EXPECT_EQ(judged(Verdict::None, {lines, far}), Verdict::None);
  std::vector<Measure> values = {far};
  judge(Verdict::Fail, values, step);
  EXPECT_EQ(values.front().least, 0);
  EXPECT_EQ(values.front().most, 5);
}

struct RunCase {
  const char* name;
  OnFailure onFailure;
  int retries;
  const char* verdicts;      // p, f or n for each attempt, g, a or s for an answer
  const char* tests;         // the number of the step before each of these, and how it ends
  const char* earlier = "";  // p, f or n for each step of a run that was aborted, - for none
};

class PlanRuns : public testing::TestWithParam<RunCase> {};

TEST_P(PlanRuns, TakeTheirSteps) {
  const Plan plan = threeSteps(GetParam().onFailure, GetParam().retries);
  std::vector<TestResult> earlier;
  for (std::size_t i = 0; i < std::strlen(GetParam().earlier); ++i) {
    const char verdict = GetParam().earlier[i];
    if (verdict == '-') continue;
    earlier.push_back({plan.steps[i].test, verdict == 'p'   ? Verdict::Pass
                                           : verdict == 'f' ? Verdict::Fail
                                                            : Verdict::None});
  }
  PlanRun run(plan, earlier);
  std::string taken;
  for (const char each : std::string(GetParam().verdicts)) {
    const bool isAnswer = each == 'g' || each == 'a' || each == 's';
    ASSERT_EQ(run.state(), isAnswer ? PlanRun::State::Asking : PlanRun::State::Performing);
    taken += isAnswer ? '?' : static_cast<char>('1' + run.stepNumber());
    switch (each) {
      case 'p': run.finish(Verdict::Pass); break;
      case 'f': run.finish(Verdict::Fail); break;
      case 'n': run.finish(Verdict::None); break;
      case 'g': run.answer(PlanRun::Answer::GoOn); break;
      case 'a': run.answer(PlanRun::Answer::Again); break;
      default: run.answer(PlanRun::Answer::Stop);
    }
  }
  taken += run.state() == PlanRun::State::Done ? "." : "!";
  EXPECT_EQ(taken, GetParam().tests);
  EXPECT_NE(run.state(), PlanRun::State::Performing);
}

INSTANTIATE_TEST_SUITE_P(
    All, PlanRuns,
    testing::Values(RunCase{"passes", OnFailure::Stop, 0, "ppp", "123."},
                    RunCase{"goes_on", OnFailure::GoOn, 0, "pfp", "123."},
                    RunCase{"stops", OnFailure::Stop, 0, "pf", "12!"},
                    RunCase{"retries", OnFailure::Stop, 2, "pffpp", "12223."},
                    RunCase{"retries_are_used_up", OnFailure::Stop, 2, "pfff", "1222!"},
                    RunCase{"asks", OnFailure::Ask, 1, "pffafgp", "122?2?3."},
                    RunCase{"asks_and_stops", OnFailure::Ask, 0, "pfs", "12?!"},
                    RunCase{"left_is_asked_for", OnFailure::GoOn, 3, "pnapns", "12?23?!"},
                    RunCase{"last_fails", OnFailure::Stop, 0, "ppf", "123."},
                    RunCase{"skips_what_is_done", OnFailure::Stop, 0, "pp", "13.", "-f"},
                    RunCase{"performs_what_was_left", OnFailure::Stop, 0, "p", "1.", "npp"},
                    RunCase{"was_stopped", OnFailure::Stop, 0, "", "!", "pf"},
                    RunCase{"has_a_retry_left", OnFailure::Stop, 1, "pf", "23.", "pf"},
                    RunCase{"was_asking", OnFailure::Ask, 0, "afgp", "?2?3.", "pf"},
                    RunCase{"was_done", OnFailure::GoOn, 0, "", ".", "pfp"}),
    [](const auto& shown) { return shown.param.name; });

TEST(TimeOuts, EndAtTheirMillisecond) {
  EXPECT_FALSE(isOverdue({.timeout = 2}, 1999));
  EXPECT_TRUE(isOverdue({.timeout = 2}, 2000));
  EXPECT_FALSE(isOverdue({.timeout = 0}, 4'000'000'000));
}

TEST(Simulations, AreOfTestsOfThePlan) {
  const Plan plan = threeSteps(OnFailure::GoOn, 0);
  std::string error;
  const auto simulation = Simulation::parse("fail:keys,retry:shell", plan, error);
  ASSERT_TRUE(simulation) << error;
  EXPECT_EQ(simulation->rehearsed(Verdict::Pass, "touch_grid", 1), Verdict::Pass);
  EXPECT_EQ(simulation->rehearsed(Verdict::Pass, "keys", 4), Verdict::Fail);
  EXPECT_EQ(simulation->rehearsed(Verdict::None, "keys", 1), Verdict::None);
  EXPECT_EQ(simulation->rehearsed(Verdict::Pass, "shell", 1), Verdict::Fail);
  EXPECT_EQ(simulation->rehearsed(Verdict::Pass, "shell", 2), Verdict::Pass);
  for (const char* const wrong : {"fail", "fail:", "fail:pad", "pass:keys", "fail:keys,",
                                  "fail:keys,retry:keys", ",fail:keys"}) {
    error.clear();
    EXPECT_FALSE(Simulation::parse(wrong, plan, error)) << wrong;
    EXPECT_NE(error, "") << wrong;
  }
}

}  // namespace
}  // namespace factory_test
