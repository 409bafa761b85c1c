#include <expat.h>
#include <gtest/gtest.h>
#include <sys/mman.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/time.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <csignal>
#include <fstream>
#include <iterator>
#include <limits>
#include <random>

#include "machine_figures.h"
#include "results/junit.h"
#include "results/results.h"

namespace factory_test {
namespace {

using std::chrono::milliseconds;
using std::chrono::sys_seconds;
namespace fs = std::filesystem;

constexpr int kMost = std::numeric_limits<int>::max();
constexpr sys_seconds kMorning(std::chrono::seconds(1'795'244'400));
constexpr sys_seconds kLast(std::chrono::seconds(253'402'300'799));  // of the year 9999
const TestResult kColours = {"colours", Verdict::Pass, kMorning, milliseconds(4200), {1440, 2560}};
const TestResult kAgain = {"colours", Verdict::Fail, {}, {}, {}, {}, 2};
const TestResult kKeys = {"� keys", Verdict::None, kLast, milliseconds(kMost), {0, kMost}};
// How these two come in.
const TestResult kLow = {"colours", Verdict::Fail, sys_seconds::min(), milliseconds(-1), {-1, -2}};
const TestResult kHigh = {"\xff keys", {}, sys_seconds::max(), milliseconds::max(), {-1, kMost}};

// What a file with kColours holds, without spaces and line ends.
constexpr auto kDocumented =
    R"({"version":2,"results":[{"test":"colours","verdict":"PASS","attempt":1,)"
    R"("started":"2026-11-21T07:00:00Z","duration_ms":4200,)"
    R"("screen":{"width":1440,"height":2560},"values":[]}]})";

std::string textOf(const fs::path& file) {
  std::ifstream stream(file, std::ios::binary);
  return {std::istreambuf_iterator<char>(stream), {}};
}

class Results : public testing::Test {
 protected:
  Results() { fs::create_directory(folder); }
  ~Results() override { fs::remove_all(folder); }

  const fs::path folder = testing::TempDir() + "results_test." + std::to_string(::getpid());
  const fs::path file = folder / "results.json";
  std::string error;
};

TEST_F(Results, AreResumedWithTheNewestOfEachTest) {
  ::setenv("TZ", "EAST-5", 1);   // the files' times are UTC everywhere
  std::ofstream(file) << " \n";  // as a new file
  for (const auto& result : {kColours, kHigh, kLow}) {
    auto book = ResultBook::open(file, error);  // anew for each, as after a restart
    ASSERT_TRUE(book && book->record(result, error)) << error;
    std::string text = textOf(file);
    std::erase_if(text, [](char letter) { return letter == ' ' || letter == '\n'; });
    EXPECT_EQ(result == kColours, text == kDocumented) << text;
  }
  const auto book = ResultBook::open(file, error);
  ASSERT_TRUE(book) << error;
  EXPECT_EQ(book->results(), (std::vector{kAgain, kKeys}));
  EXPECT_EQ(book->find("Keys"), nullptr);
}

TEST_F(Results, KeepWhatWasMeasuredOnOneUnit) {
  TestResult result = kColours;
  result.values = {{"worst distance", "mm", 0.1, {}, 2.5}, {"steps", "", 1e300, -1, {}}};
  {
    auto book = ResultBook::open({.json = file}, {.unit = "A1", .operatorName = "Bob"}, error);
    result.reason = Reason::TimeOut;
    ASSERT_TRUE(book && book->record(result, error)) << error;
    result.values.front().value = std::numeric_limits<double>::infinity();  // no number of a file
    ASSERT_TRUE(book->record(result, error)) << error;
  }
  EXPECT_FALSE(ResultBook::open({.json = file}, {.unit = "B2"}, error));
  EXPECT_EQ(error,
            file.native() + ": holds the results of unit A1, not of B2; --new-run begins anew");
  const auto book = ResultBook::open(file, error);
  ASSERT_TRUE(book) << error;
  EXPECT_EQ(book->run().unit, "A1");
  result.values.erase(result.values.begin());
  result.attempt = 2;
  result.operatorName = "Bob";
  EXPECT_EQ(book->results(), std::vector{result});
}

const RunStart kStart = {.unit = "A1", .planName = "P", .planHash = "f00d", .tests = {"a", "b"}};

TEST_F(Results, AreGoneOnWithOnlyForTheirUnitAndPlan) {
  const RunStart nobody = {.planName = "P", .planHash = "f00d", .tests = {"a", "b"}};
  const RunStart other = {.unit = "A1", .planName = "P", .planHash = "cafe", .tests = {"a", "b"}};
  struct Case {
    RunStart held, wanted;
    std::string stranger;
  };
  for (const auto& [held, wanted, stranger] : std::to_array<Case>({
           {kStart, kStart, ""},
           {kStart, nobody, ""},
           {nobody, kStart, "an unknown unit, not of A1"},
           {other, kStart, "plan 'P' (cafe), not of plan 'P' (f00d)"},
           {{.unit = "A1"}, kStart, "an unknown plan, not of plan 'P' (f00d)"},
       })) {
    const Keeping anew = {.json = file, .resume = Resume::No};
    {
      auto first = ResultBook::open(anew, held, error);
      ASSERT_TRUE(first && first->results().empty() && first->record(kColours, error)) << error;
    }
    error.clear();
    EXPECT_EQ(ResultBook::open({.json = file}, wanted, error).has_value(), stranger.empty());
    EXPECT_NE(error.find(stranger), std::string::npos) << error;
  }
}

TEST_F(Results, OfAPlanThatIsThroughAreShownButNotGoneOnWith) {
  const auto opened = [this](Resume resume) {
    return ResultBook::open({.json = file, .resume = resume}, kStart, error);
  };
  for (const bool isStopped : {false, true}) {
    ASSERT_TRUE(opened(Resume::No)->record({"a", Verdict::Pass}, error)) << error;
    auto book = opened(Resume::Unfinished);
    ASSERT_EQ(book->results().size(), 1);
    ASSERT_TRUE(isStopped ? book->finish(error) : book->record({"b", Verdict::Fail}, error));
    book.reset();
    EXPECT_EQ(opened(Resume::Yes)->results().size(), isStopped ? 1 : 2);
    EXPECT_EQ(opened(Resume::Unfinished)->results().size(), 0);
  }
}

TEST_F(Results, OfAUnitStayUntilTheNextOneCanBegin) {
  auto book =
      ResultBook::open({.json = file, .database = folder / "station.db"}, {.unit = "A1"}, error);
  ASSERT_TRUE(book && book->record(kColours, error)) << error;
  fs::remove(file);
  fs::create_directory(file);
  EXPECT_FALSE(book->startUnit({.unit = "B2"}, error));
  EXPECT_TRUE(book->hasBegun() && book->find(kColours.test) != nullptr);
  fs::remove(file);
  EXPECT_TRUE(book->startUnit({.unit = "B2"}, error)) << error;
  EXPECT_EQ(book->find(kColours.test), nullptr);
}

TEST_F(Results, BelongToOneProgramAtATime) {
  const fs::path link = folder / "link";
  fs::create_symlink(file, link);
  {
    const auto first = ResultBook::open(file, error);
    ASSERT_TRUE(first) << error;
    for (const Keeping& places : {Keeping{.json = link}, {.junit = file}}) {
      EXPECT_FALSE(ResultBook::open(places, {}, error));
      EXPECT_TRUE(error.ends_with(": is in use by another program (process " +
                                  std::to_string(::getpid()) + ")"))
          << error;
    }
  }
  EXPECT_TRUE(ResultBook::open(link, error)) << error;
}

TEST_F(Results, LeaveWhatHasTheNameOfTheirLockAndIsNone) {
  const fs::path lock = file.native() + ".lock";
  const fs::path victim = folder / "victim";
  for (const std::string held : {"", "12"}) {  // even what may pass for a lock, behind a link
    std::ofstream(victim, std::ios::trunc) << held;
    fs::create_symlink(victim, lock);
    EXPECT_FALSE(ResultBook::open(file, error));
    EXPECT_TRUE(error.ends_with("results.json.lock is no lock file, and stays as it is")) << error;
    EXPECT_EQ(textOf(victim), held);
    EXPECT_TRUE(fs::remove(lock)) << "the link is still there";
  }
  for (const std::string own : {"<testsuites/>", "1234567890123456", "-1"}) {
    std::ofstream(lock) << own;
    EXPECT_FALSE(ResultBook::open(file, error));
    EXPECT_EQ(textOf(lock), own);
    fs::remove(lock);
  }
  std::ofstream(lock) << "999999";  // what a killed program left
  auto book = ResultBook::open(file, error);
  EXPECT_TRUE(book) << error;
  fs::remove(lock);
  std::ofstream(lock) << "12";  // another's by now
  book.reset();
  EXPECT_EQ(textOf(lock), "12");
}

TEST_F(Results, ThatAreDamagedAreNamedAndLeftAsTheyAre) {
  const std::string deep = std::string(500'000, '[') + std::string(500'000, ']');
  for (const auto& [from, to, reason] : std::to_array<std::array<std::string, 3>>({
           {kDocumented, "{", "is not JSON"},
           {"1440,", "1440", "is not JSON"},
           {"1440", "1e999", "is not JSON"},
           {"]}", std::string("]}\n\0{", 5), "is not JSON: holds a NUL byte in line 2"},
           {"colours", "\xff", "is not JSON"},
           {kDocumented, std::string(2 << 20, ' '), "is longer than a MiB"},
           {kDocumented, "[1]", "has no list of \"results\""},
           {"}]", "}," + deep + "]", "result 2 has no valid \"test\""},
           {"\"colours\"", "7", "result 1 has no valid \"test\""},
           {"PASS", "RETRY", "result 1 has no valid \"verdict\""},
           {"11-21", "02-29", "result 1 has no valid \"started\""},
           {"4200", "18446744073709551615", "result 1 has no valid \"duration_ms\""},
           {"1440", "2147483648", "result 1 has no valid \"screen\""},
           {"\"attempt\"", R"("reason":"bad","attempt")", "result 1 has no valid \"reason\""},
           {"\"attempt\"", R"("operator":7,"attempt")", "result 1 has no valid \"operator\""},
           {"height", "depth", "result 1 has no valid \"screen\""},
           {"\"attempt\":1", "\"attempt\":0", "result 1 has no valid \"attempt\""},
           {"[]}", R"([{"name":"a","unit":"","value":"1"}]})", "result 1 has no valid \"values\""},
           {R"({"v)", R"({"unit":7,"v)", "has no valid \"unit\""},
           {":2,", ":3,", "is of version 3, newer than this program's 2"},
           {":2,", ":-2,", "has no valid \"version\""},
       })) {
    std::string text = kDocumented;
    text.replace(text.find(from), from.size(), to);
    std::ofstream(file) << text;
    EXPECT_FALSE(ResultBook::open(file, error));
    EXPECT_EQ(error, file.native() + ": " + reason);
    EXPECT_TRUE(textOf(file) == text) << reason;
  }
}

TEST_F(Results, GoOnlyWhereTheyCanBeKept) {
  ASSERT_EQ(::mkfifo((folder / "pipe").c_str(), 0600), 0);
  for (const fs::path& unfit : {folder, folder / "pipe"}) {
    EXPECT_FALSE(ResultBook::open(unfit, error));
    EXPECT_EQ(error, unfit.native() + ": is not a regular file");
    EXPECT_FALSE(ResultBook::open({.junit = unfit}, {}, error));
    EXPECT_EQ(error, unfit.native() + ": is not a regular file");
  }
  EXPECT_FALSE(ResultBook::open(folder / "missing" / "file", error));
  EXPECT_TRUE(error.ends_with("/missing/file: cannot be written: it or its folder is missing"));
  EXPECT_TRUE(ResultBook::open("", error)->record(kColours, error)) << "in memory";
}

TEST_F(Results, TakeThePlaceOfTheFileThatALinkLeadsTo) {
  constexpr auto kMode = fs::perms::owner_all | fs::perms::others_write;
  fs::create_symlink("far", file);  // which is not there yet
  auto book = ResultBook::open(file, error);
  ASSERT_TRUE(book) << error;
  fs::permissions(folder / "far", kMode);
  EXPECT_TRUE(book->record(kColours, error)) << error;
  EXPECT_TRUE(fs::is_symlink(file));
  EXPECT_EQ(fs::status(folder / "far").permissions(), kMode);
  EXPECT_TRUE(fs::exists(folder / "far.lock"));
}

TEST_F(Results, SurviveAFullDiskBehindALink) {
  fs::create_symlink(folder / "far", file);
  std::ofstream(folder / "far") << kDocumented;
  std::ofstream(folder / "far.tmp") << "{ what a killed writer left";
  auto book = ResultBook::open(file, error);
  ASSERT_TRUE(book) << error;
  const std::string before = textOf(file);
  // Files of this process end after some bytes, as on a full disk.
  (void)std::signal(SIGXFSZ, SIG_IGN);
  rlimit former = {};
  ::getrlimit(RLIMIT_FSIZE, &former);
  const rlimit little = {textOf(file).size(), former.rlim_max};
  ::setrlimit(RLIMIT_FSIZE, &little);
  const bool isWritten = book->record(kKeys, error);
  ::setrlimit(RLIMIT_FSIZE, &former);
  EXPECT_FALSE(isWritten);
  EXPECT_EQ(error, file.native() + ": cannot be written: the file would be too large");
  EXPECT_EQ(textOf(file), before);
  EXPECT_FALSE(fs::exists(folder / "far.tmp"));
  EXPECT_FALSE(book->isSaved(kKeys.test));
  EXPECT_TRUE(book->isSaved(kColours.test));
  EXPECT_TRUE(book->saveAgain(error)) << error;
  EXPECT_TRUE(book->isSaved(kKeys.test));
  ::setrlimit(RLIMIT_FSIZE, &little);
  for (int times = 0; times < 2; ++times) EXPECT_FALSE(book->finish(error)) << "is left to save";
  ::setrlimit(RLIMIT_FSIZE, &former);
  book.reset();
  EXPECT_EQ(ResultBook::open(folder / "far", error)->results(), (std::vector{kColours, kKeys}));
}

TEST_F(Results, MakeAWellFormedReport) {
  std::vector<TestResult> results = {kColours, kAgain, kKeys};
  results[1].test = "a<b>&\"'\xff\n \xd7\x90";
  for (int byte = 0; byte < 0x100; ++byte) {
    // Among them what is UTF-8 and yet no character.
    for (const char* const before : {"", "\xef\xbf"}) {
      results.push_back({before + std::string(1, static_cast<char>(byte))});
    }
  }
  const JunitSuite suite = {.run = {.tests = {"later", "a.b", results[1].test}},
                            .results = results};
  const std::string xml = junitXml({&suite, 1});
  for (
      const char* const part :
      {R"(<testsuite name="factory_test" tests="517" failures="1" errors="0" skipped="515" time="2147487.847">)",
       R"(<testcase classname="factory_test" name="colours" time="4.200">)",
       R"("started" value="2026-11-21T07:00:00Z"/>)", R"("screen" value="1440x2560"/>)",
       R"(name="a&lt;b&gt;&amp;&quot;'�&#10; א" time="0.000">)", "<failure message=\"FAIL\"/>",
       R"(<skipped message="no verdict"/>)",
       R"(name="later" time="0.000">
      <skipped message="not run"/>)"}) {
    EXPECT_NE(xml.find(part), std::string::npos) << part;
  }
  EXPECT_TRUE(isJunitHead(xml) && isJunitHead("") &&
              isJunitHead("\xef\xbb\xbf<!-- a --> <testsuite>"));
  for (const char* const other : {"text", "<html>", "<testsuites", "<?xml <testsuites>", "<!--"}) {
    EXPECT_EQ(isJunitHead(other), std::string_view(other) == "<testsuites") << other;
  }
  auto* const parser = XML_ParserCreate(nullptr);
  EXPECT_EQ(XML_Parse(parser, xml.data(), static_cast<int>(xml.size()), 1), XML_STATUS_OK);
  XML_ParserFree(parser);
}

bool isShort(const std::string& text) {
  return !text.empty() && text.size() <= kFigureLetters &&
         std::ranges::all_of(text, [](char letter) { return letter >= ' ' && letter <= '~'; });
}

TEST_F(Results, StandBesideShortFiguresOfTheMachine) {
  const auto write = [this](const char* name, std::string_view text) {
    fs::create_directories((folder / name).parent_path());
    std::ofstream(folder / name) << text;
  };
  write("class/power_supply/A_mouse/scope", "Device\n");
  write("class/power_supply/A_mouse/capacity", "3\n");
  for (const auto& [capacity, status, level, most, battery, charger, light] :
       std::to_array<std::array<const char*, 7>>({
           {"57\n", "Charging\n", "1\n", "999\n", "Battery 57%", "Charging", "Light 0%"},
           {"0\n", "Discharging", "63", "100", "Battery 0%", "On battery", "Light 63%"},
           {"1\n", "Full", "2147483647", "2147483647", "Battery 1%", "Mains", "Light 100%"},
           {"-1\n", "", "1", "0", "No battery", "Mains", "Light n/a"},
           {"99999999999", "\xff", "1 ", "2", "No battery", "Mains", "Light n/a"},
       })) {
    write("class/power_supply/BAT0/capacity", capacity);
    write("class/power_supply/BAT0/status", status);
    write("class/backlight/panel/brightness", level);
    write("class/backlight/panel/max_brightness", most);
    const MachineFigures figures = readMachineFigures(folder);
    EXPECT_EQ(figures.battery, battery);
    EXPECT_EQ(figures.charger, charger);
    EXPECT_EQ(figures.brightness, light);
    EXPECT_TRUE(isShort(figures.hostName) && isShort(figures.address) && isShort(figures.load));
    EXPECT_FALSE(figures.address.starts_with("127."));
  }
}

constexpr int kTests = 20;  // recorded round and round

// The number of a record stands in its start time.
TestResult resultOf(int number) {
  const sys_seconds started{std::chrono::seconds(number)};
  return {"test " + std::to_string(number % kTests), Verdict::Pass, started, {}, {}};
}

// Records in a process of its own, which its alarm ends in any moment after the first record.
// `safe` is the number of the last one that was written.
void killWhileWriting(const fs::path& file, std::atomic<int>& safe, const itimerval& life) {
  const int before = safe;
  const pid_t writer = ::fork();
  if (writer == 0) {
    std::string error;
    auto book = ResultBook::open(file, error);
    while (book && book->record(resultOf(safe + 1), error)) {
      if (++safe == before + 1) ::setitimer(ITIMER_REAL, &life, nullptr);
    }
    ::_exit(1);
  }
  int end = 0;
  ::waitpid(writer, &end, 0);
  ASSERT_TRUE(WIFSIGNALED(end) && WTERMSIG(end) == SIGALRM) << "it ended by itself";
}

TEST_F(Results, LoseAtMostTheRunningTestOfAKilledWriter) {
  auto* const shared = ::mmap(nullptr, sizeof(std::atomic<int>), PROT_READ | PROT_WRITE,
                              MAP_SHARED | MAP_ANONYMOUS, -1, 0);
  auto* const safe = static_cast<std::atomic<int>*>(shared);
  std::mt19937 random(20261121);
  std::uniform_int_distribution<suseconds_t> lives(1, 20'000);
  for (int kill = 0; kill < 50; ++kill) {
    SCOPED_TRACE(kill);
    const itimerval life = {{}, {0, lives(random)}};
    ASSERT_NO_FATAL_FAILURE(killWhileWriting(file, *safe, life));
    const auto book = ResultBook::open(file, error);
    ASSERT_TRUE(book) << error;
    for (int number = std::max(1, *safe - kTests + 2); number <= *safe; ++number) {
      const TestResult* const found = book->find(resultOf(number).test);
      ASSERT_TRUE(found != nullptr && found->started == resultOf(number).started) << number;
    }
  }
}

}  // namespace
}  // namespace factory_test
