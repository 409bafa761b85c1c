// A station that tests one unit after another, as fast as it can:
// station DATABASE STATION UNITS TESTS [LINE]
// Ends once everything is kept, with a line also sent. Its texts are what an export must stand.
#include <cstdio>
#include <cstdlib>
#include <span>
#include <string>
#include <thread>

#include "results/results.h"

namespace {

using namespace factory_test;

constexpr std::chrono::sys_seconds kMorning(std::chrono::seconds(1'795'244'400));
constexpr int kDays = 5;
constexpr auto kHostile =
    "<img src=http://127.0.0.1:9/x onerror='throw 1'>&\"\xff\xef\xbf\xbe\n,;=";

int fail(const std::string& why) {
  std::fprintf(stderr, "station: %s\n", why.c_str());
  return EXIT_FAILURE;
}

TestResult resultOf(int unit, int test, const RunStart& run) {
  TestResult result;
  result.test = run.tests.at(static_cast<std::size_t>(test));
  result.verdict = (unit * 7 + test) % 9 == 0 ? Verdict::Fail : Verdict::Pass;
  if (result.verdict == Verdict::Fail) result.reason = Reason::TimeOut;
  result.started = run.started + std::chrono::seconds(test);
  result.duration = std::chrono::milliseconds(100 + test);
  result.screen = {480, 800};
  const double number = unit + test / 3.0;
  result.values = {{"worst distance", "mm", number, {}, 100.0}, {"<i>hits</i>", "", 7, 7, 7}};
  return result;
}

bool isSent(const ResultBook& book) {
  const auto status = book.lineStatus();
  return !status || status->isUpToDate;
}

}  // namespace

int main(int count, char** words) {
  const std::span<char*> arguments(words, static_cast<std::size_t>(count));
  if (count < 5) return fail("DATABASE STATION UNITS TESTS [LINE]");
  RunStart run = {.operatorName = kHostile, .planName = kHostile, .planHash = "h"};
  run.software = "0";
  run.station = arguments[2];
  for (int test = 0; test < std::atoi(arguments[4]); ++test) {
    run.tests.push_back("test " + std::to_string(test) + kHostile);
  }
  run.planHash += arguments[4];
  const Keeping places = {.database = arguments[1], .line = count > 5 ? arguments[5] : ""};
  std::string error;
  std::optional<ResultBook> book;
  for (int unit = 0; unit < std::atoi(arguments[3]); ++unit) {
    run.unit = "=" + run.station + "-" + std::to_string(unit);
    run.started = kMorning + std::chrono::days(unit % kDays) + std::chrono::minutes(unit);
    if (!book) {
      book = ResultBook::open(places, run, error);
    } else if (!book->startUnit(run, error)) {
      return fail(error);
    }
    if (!book) return fail(error);
    for (int test = 0; test < std::atoi(arguments[4]); ++test) {
      if (!book->record(resultOf(unit, test, run), error)) return fail(error);
    }
    std::printf("%d\n", unit);
    std::fflush(stdout);
  }
  while (book && !isSent(*book)) std::this_thread::sleep_for(std::chrono::milliseconds(10));
  return EXIT_SUCCESS;
}
