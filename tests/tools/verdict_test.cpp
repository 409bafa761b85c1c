#include "verdict.h"

#include <csignal>

#include "runs.h"

namespace brimol::replay {
namespace {

using Kind = RunEnd::Kind;

constexpr auto kStart = R"({"kind":"start","time":0})"
                        "\n";
constexpr auto kTap = R"({"kind":"step","time":1500,"file":"a.trace","line":3,"text":"tap \"X\""})"
                      "\n"
                      R"({"kind":"event","time":1501,"file":"a.trace","line":3,"input":"close"})"
                      "\n";
constexpr auto kFailed =
    R"({"kind":"expectation","time":9,"file":"a.trace","line":8,"text":"expect","passed":false})"
    "\n"
    R"({"kind":"end","time":9,"exit":1,"reason":"failed"})";
constexpr auto kBadTrace =
    R"({"kind":"error","time":0,"message":"odd step","file":"b.trace","line":2})"
    "\n"
    R"({"kind":"end","time":0,"exit":2,"reason":"error"})";
constexpr auto kClosed = R"({"kind":"end","time":2000,"exit":0,"reason":"closed"})";

struct Case {
  const char* name;
  std::string session;
  RunEnd end;
  std::size_t differences;
  Verdict verdict;
  const char* place;
  const char* says;
};
class Judge : public testing::TestWithParam<Case> {};

TEST_P(Judge, NamesWhatHappenedAndWhere) {
  const Case& given = GetParam();
  const Judgement judgement = judge(sessionOf(given.session), given.end, given.differences);
  EXPECT_EQ(judgement.verdict, given.verdict) << judgement.headline;
  EXPECT_EQ(judgement.place.text(), given.place);
  const std::string said = judgement.headline + " " + judgement.detail;
  EXPECT_NE(said.find(given.says), std::string::npos) << said;
}

const std::string kSession = std::string(kStart) + kTap;
INSTANTIATE_TEST_SUITE_P(
    All, Judge,
    testing::Values(
        Case{"Passed", kSession + kClosed, {Kind::Exited}, 0, Verdict::Passed, "", "to its end"},
        Case{"Differs", kSession + kClosed, {Kind::Exited}, 2, Verdict::Failed, "", "2 frames"},
        Case{"Expectation",
             kSession + kFailed,
             {Kind::Exited, 1},
             0,
             Verdict::Failed,
             "a.trace:8",
             "An expectation failed: expect"},
        Case{"ApplicationFailed",
             kSession + kClosed,
             {Kind::Exited, 7},
             0,
             Verdict::Failed,
             "",
             "exit code 7"},
        Case{"BadTrace",
             std::string(kStart) + kBadTrace,
             {Kind::Exited, 2},
             0,
             Verdict::Unusable,
             "b.trace:2",
             "odd step"},
        Case{"BadCommandLine", "", {Kind::Exited, 2}, 0, Verdict::Unusable, "", "refused"},
        Case{"NotOfThePlatform", "", {Kind::Exited, 0}, 0, Verdict::Failed, "", "no session"},
        Case{"EndedEarly",
             kSession,
             {Kind::Exited, 0},
             0,
             Verdict::Failed,
             "a.trace:3",
             "before its trace did"},
        Case{"Crashed",
             kSession,
             {Kind::Signalled, SIGSEGV},
             0,
             Verdict::Crashed,
             "a.trace:3",
             "at 1.501 s: close, of the step tap \"X\""},
        Case{"CrashedAfterItsEnd",
             kSession + kClosed,
             {Kind::Signalled, SIGABRT},
             0,
             Verdict::Crashed,
             "a.trace:3",
             "Aborted"},
        Case{
            "CrashedAtOnce", "", {Kind::Signalled, SIGSEGV}, 0, Verdict::Crashed, "", "first step"},
        Case{"Hung", kSession, {Kind::Hung}, 0, Verdict::Hung, "a.trace:3", "hung"},
        Case{"NotStarted",
             "",
             {Kind::NotStarted, 0, {}, "no file"},
             0,
             Verdict::Unusable,
             "",
             "no file"}),
    [](const auto& given) { return given.param.name; });

}  // namespace
}  // namespace brimol::replay
