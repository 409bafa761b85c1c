#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <csignal>
#include <iostream>
#include <random>

#include "results/results.h"
#include "results/unique_fd.h"
#include "scratch.h"

namespace factory_test {
namespace {

constexpr int kKills = 50;
constexpr int kTests = 20;            // recorded round and round
constexpr int kLongestLife = 20'000;  // microseconds after the first record
constexpr unsigned kSeed = 20261121;

// The number of a record stands in its start time.
TestResult resultOf(int number) {
  return {"test " + std::to_string(number % kTests),
          Verdict::Pass,
          std::chrono::sys_seconds(std::chrono::seconds(number)),
          {},
          {}};
}

int newestIn(const ResultBook& book) {
  int newest = 0;
  for (const TestResult& result : book.results()) {
    newest = std::max(newest, static_cast<int>(result.started.time_since_epoch().count()));
  }
  return newest;
}

// Records until it is killed, and reports the number of each record that is safe.
[[noreturn]] void recordForever(const std::filesystem::path& file, const UniqueFd& reports) {
  std::string error;
  auto book = ResultBook::open(file, error);
  if (!book) ::_exit(1);
  for (int number = newestIn(*book) + 1; book->record(resultOf(number), error); ++number) {
    if (::write(reports.get(), &number, sizeof number) != sizeof number) break;
  }
  ::_exit(1);
}

bool nextReport(const UniqueFd& reports, int& number) {
  return ::read(reports.get(), &number, sizeof number) == sizeof number;
}

// The last record that a writer reported before it was killed, 0 for none.
int killedWriter(const std::filesystem::path& file, useconds_t life) {
  std::array<int, 2> ends = {};
  if (::pipe(ends.data()) != 0) return 0;
  const UniqueFd reports(ends[0]);
  UniqueFd toReports(ends[1]);
  const pid_t writer = ::fork();
  if (writer == 0) recordForever(file, toReports);
  toReports.close();
  int last = 0;
  if (nextReport(reports, last)) ::usleep(life);  // any moment of its loop
  ::kill(writer, SIGKILL);
  int status = 0;
  ::waitpid(writer, &status, 0);
  if (!WIFSIGNALED(status)) return 0;
  while (nextReport(reports, last)) {
  }
  return last;
}

TEST(KilledWriter, LosesAtMostTheRunningTest) {
  const Scratch scratch;
  const auto file = scratch.at("results.json");
  std::mt19937 random(kSeed);
  std::uniform_int_distribution<useconds_t> lives(0, kLongestLife);
  int halfWritten = 0;
  for (int kill = 0; kill < kKills; ++kill) {
    const useconds_t life = lives(random);
    SCOPED_TRACE("seed " + std::to_string(kSeed) + ", kill " + std::to_string(kill) + " after " +
                 std::to_string(life) + " us");
    const int last = killedWriter(file, life);
    ASSERT_GT(last, 0) << "the writer ended by itself";
    halfWritten += static_cast<int>(scratch.names().contains(".results.json.tmp"));

    std::string error;
    auto book = ResultBook::open(file, error);
    ASSERT_TRUE(book) << error;
    const int newest = newestIn(*book);
    EXPECT_GE(newest, last);
    EXPECT_LE(newest, last + 1);  // written, and killed before the report
    for (int number = std::max(1, newest - kTests + 1); number <= newest; ++number) {
      const TestResult wanted = resultOf(number);
      const TestResult* const found = book->find(wanted.test);
      ASSERT_TRUE(found != nullptr && *found == wanted) << wanted.test;
    }
    book.reset();
    EXPECT_EQ(scratch.names(), std::set<std::string>{"results.json"});
  }
  RecordProperty("killed_while_writing", halfWritten);
  std::cout << "killed while a temporary file stood: " << halfWritten << " of " << kKills << '\n';
}

}  // namespace
}  // namespace factory_test
