#include "results/results.h"

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <limits>

#include "results/results_json.h"
#include "scratch.h"

namespace factory_test {

// The library's search for how to print it.
static void PrintTo(const TestResult& result, std::ostream* out) {
  *out << resultsJson(std::span(&result, 1));
}

namespace {

using std::chrono::milliseconds;
using std::chrono::sys_days;
using std::chrono::sys_seconds;
using Names = std::set<std::string>;
namespace fs = std::filesystem;

constexpr sys_seconds kMorning =
    sys_days(std::chrono::year(2026) / 11 / 21) + std::chrono::hours(7);
const TestResult kColours = {"colours", Verdict::Pass, kMorning, milliseconds(4200), {1440, 2560}};
const TestResult kKeys = {"keys", Verdict::None, kMorning, milliseconds(0), {0, 0}};

class Results : public testing::Test {
 protected:
  std::optional<ResultBook> open(std::string_view name = "results.json") {
    return ResultBook::open(scratch.at(name), error);
  }
  std::string reasonFor(std::string_view name, std::string_view reason) const {
    return scratch.at(name).native() + ": " + std::string(reason);
  }

  Scratch scratch;
  std::string error;
};

TEST_F(Results, AreResumedWithTheNewestOfEachTest) {
  TestResult again = kColours;
  again.verdict = Verdict::Fail;
  for (const auto& result : {kColours, kKeys, again}) {
    auto book = open();  // anew for each, as after a restart
    ASSERT_TRUE(book) << error;
    ASSERT_TRUE(book->record(result, error)) << error;
  }
  const auto book = open();
  ASSERT_TRUE(book) << error;
  EXPECT_EQ(book->results(), (std::vector{again, kKeys}));
  ASSERT_NE(book->find("keys"), nullptr);
  EXPECT_EQ(*book->find("keys"), kKeys);
  EXPECT_EQ(book->find("Keys"), nullptr);
}

constexpr auto kDocumented = R"({
  "format": 1,
  "results": [
    {
      "test": "colours",
      "verdict": "PASS",
      "started": "2026-11-21T07:00:00Z",
      "duration_ms": 4200,
      "screen": {
        "width": 1440,
        "height": 2560
      }
    }
  ]
}
)";

TEST_F(Results, HaveTheDocumentedLayout) {
  ASSERT_TRUE(open()->record(kColours, error)) << error;
  EXPECT_EQ(scratch.read("results.json"), kDocumented);
  EXPECT_EQ(scratch.names(), Names{"results.json"});
}

TEST_F(Results, StayInMemoryWithoutAPath) {
  auto book = ResultBook::open("", error);
  ASSERT_TRUE(book) << error;
  EXPECT_TRUE(book->record(kColours, error));
  EXPECT_EQ(book->results(), std::vector{kColours});
  EXPECT_EQ(scratch.names(), Names{});
}

TEST_F(Results, AreMadeStorable) {
  using Limits = std::numeric_limits<int>;
  const auto never = static_cast<Verdict>(7);
  auto book = open();
  ASSERT_TRUE(book) << error;
  for (const auto& wild : std::to_array<TestResult>({
           {"\xff", never, sys_seconds::min(), milliseconds::min(), {Limits::min(), -1}},
           {"\xfe", Verdict::Pass, sys_seconds::max(), milliseconds::max(), {1, Limits::max()}},
           {std::string("a\0\n\"\xf0\x9f\x98\x80", 8), Verdict::Fail, {}, {}, {}},
       })) {
    ASSERT_TRUE(book->record(wild, error)) << error;
  }
  const auto kept = book->results();
  const std::chrono::year_month_day last(std::chrono::floor<std::chrono::days>(kept[0].started));
  EXPECT_EQ(kept.size(), 2U);  // two bytes that are no text look the same
  EXPECT_EQ(last, std::chrono::year(9999) / 12 / 31);
  EXPECT_EQ(kept[0].duration, kLongestDuration);
  EXPECT_EQ(book->find("\xff"), book->find("\xef\xbf\xbd"));
  book.reset();
  EXPECT_EQ(open().value().results(), kept) << error;
}

TEST_F(Results, TakeNoneOfWildFiguresBelowZero) {
  EXPECT_EQ(
      storable({"x", static_cast<Verdict>(-1), sys_seconds::min(), milliseconds(-1), {-1, -2}}),
      (TestResult{"x", Verdict::None, sys_days(std::chrono::year(0) / 1 / 1), {}, {}}));
}

struct Damage {
  const char* name;
  const char* from;  // in the documented file
  const char* to;
  const char* reason;
};
class DamagedResults : public Results, public testing::WithParamInterface<Damage> {};

TEST_P(DamagedResults, AreNamedAndLeftAsTheyAre) {
  const auto& [name, from, to, reason] = GetParam();
  std::string text = kDocumented;
  ASSERT_NE(text.find(from), std::string::npos);
  text.replace(text.find(from), std::string_view(from).size(), to);
  scratch.write("results.json", text);
  EXPECT_FALSE(open());
  EXPECT_EQ(error, reasonFor("results.json", reason));
  EXPECT_EQ(scratch.read("results.json"), text);
  EXPECT_EQ(scratch.names(), Names{"results.json"});
}

constexpr auto kNotAText = "result 1: \"test\" is not a text";
constexpr auto kNotAVerdict = "result 1: \"verdict\" is not PASS, FAIL or none";
constexpr auto kNotATime = "result 1: \"started\" is not a time like 2026-11-21T07:00:00Z";
constexpr auto kNotADuration =
    "result 1: \"duration_ms\" is not a whole number of milliseconds, at most a year";
constexpr auto kNotASize = "result 1: \"screen\" is not a width and a height in pixels";
constexpr auto kNotTheFormat = "has another \"format\" than 1";
constexpr auto kDate = "2026-11-21T07:00:00Z";

INSTANTIATE_TEST_SUITE_P(
    All, DamagedResults,
    testing::ValuesIn(std::to_array<Damage>({
        {"Empty", kDocumented, "", "is not JSON (line 1)"},
        {"CutShort", "1440,", "1440", "is not JSON (line 11)"},
        {"HugeNumber", "1440", "1e999", "is not JSON"},
        {"NoUtf8", "colours", "\xff", "is not JSON (line 5)"},
        {"NoObject", kDocumented, "[1]", "is no results file"},
        {"NoFormat", "format", "Format", "is no results file: \"format\" is missing"},
        {"LaterFormat", "1,", "2,", kNotTheFormat},
        {"FormatOfText", "1,", "\"1\",", kNotTheFormat},
        {"FormatOfBool", "1,", "true,", kNotTheFormat},
        {"NoResults", "results", "result", "has no list of \"results\""},
        {"ResultsOfText", kDocumented, R"({"format":1,"results":""})",
         "has no list of \"results\""},
        {"NoResultObject", "[\n", "[3,\n", "result 1: is no object"},
        {"NoTest", "test", "tost", "result 1: \"test\" is missing"},
        {"NumberForTest", "\"colours\"", "7", kNotAText},
        {"UnknownVerdict", "PASS", "RETRY", kNotAVerdict},
        {"NullVerdict", "\"PASS\"", "null", kNotAVerdict},
        {"ShortTime", kDate, "2026-11-21T07:00Z", kNotATime},
        {"LocalTime", kDate, "2026-11-21T07:00:00+", kNotATime},
        {"SignInTime", kDate, "2026-11-21T07:00:-1Z", kNotATime},
        {"NoLeapDay", kDate, "2027-02-29T07:00:00Z", kNotATime},
        {"Month13", kDate, "2026-13-01T07:00:00Z", kNotATime},
        {"Hour24", kDate, "2026-11-21T24:00:00Z", kNotATime},
        {"Minute60", kDate, "2026-11-21T07:60:00Z", kNotATime},
        {"Second60", kDate, "2026-11-21T07:00:60Z", kNotATime},
        {"NegativeDuration", "4200", "-1", kNotADuration},
        {"FractionOfDuration", "4200", "4.2", kNotADuration},
        {"LongerThanAYear", "4200", "31536000001", kNotADuration},
        {"LongerThanAll", "4200", "18446744073709551615", kNotADuration},
        {"NegativeScreen", "1440", "-1440", kNotASize},
        {"HugeScreen", "1440", "2147483648", kNotASize},
        {"NoHeight", "height", "depth", kNotASize},
        {"TextForScreen", "{\n        \"width\": 1440,\n        \"height\": 2560\n      }",
         "\"1x1\"", kNotASize},
        {"SameTestTwice", kDocumented,
         R"({"format":1,"results":[
{"test":"a","verdict":"none","started":"2024-02-29T23:59:59Z","duration_ms":0,"screen":{"width":0,"height":0}},
{"test":"a","verdict":"none","started":"2024-02-29T23:59:59Z","duration_ms":0,"screen":{"width":0,"height":0}}]})",
         "result 2: its test stands twice"},
    })),
    [](const auto& row) { return row.param.name; });

TEST_F(Results, NeedAFileThatTheyCanRead) {
  scratch.write("long", std::string(kLongestJson + 1, ' '));
  fs::create_directory(scratch.at("folder"));
  fs::create_symlink("loop", scratch.at("loop"));
  ASSERT_EQ(::mkfifo(scratch.at("pipe").c_str(), 0600), 0);
  const Names before = scratch.names();
  const auto refused = [this](std::string_view name, std::string_view reason) {
    error.clear();
    EXPECT_FALSE(open(name)) << name;
    EXPECT_EQ(error, reasonFor(name, reason));
  };
  refused("long", "is longer than 1048576 bytes");
  refused("folder", "is not a regular file");
  refused("pipe", "is not a regular file");
  refused("loop", "Too many levels of symbolic links");
  refused("missing/results.json", "no lock can be made beside it: No such file or directory");
  EXPECT_EQ(scratch.names(), before);
}

TEST_F(Results, GoWhereALinkLeadsAndKeepItsPermissions) {
  fs::create_directory(scratch.at("folder"));
  fs::create_symlink("folder/far.json", scratch.at("near"));
  fs::create_symlink(scratch.at("near"), scratch.at("nearest"));
  ASSERT_TRUE(open("nearest").value().record(kColours, error)) << error;
  EXPECT_EQ(scratch.read("folder/far.json"), kDocumented);

  constexpr auto kShared = fs::perms(0640);
  fs::permissions(scratch.at("folder/far.json"), kShared);
  ASSERT_TRUE(open("nearest").value().record(kKeys, error)) << error;
  EXPECT_TRUE(fs::is_symlink(scratch.at("nearest")));
  EXPECT_TRUE(fs::is_symlink(scratch.at("near")));
  EXPECT_EQ(fs::status(scratch.at("folder/far.json")).permissions(), kShared);
  EXPECT_EQ(open("folder/far.json").value().results(), (std::vector{kColours, kKeys}));
}

TEST_F(Results, AreForOthersToReadAsTheUserWants) {
  const mode_t before = ::umask(027);
  ASSERT_TRUE(open()->record(kColours, error)) << error;
  ::umask(before);
  EXPECT_EQ(fs::status(scratch.at("results.json")).permissions(), fs::perms(0640));
}

TEST_F(Results, HaveOneOwner) {
  fs::create_symlink("results.json", scratch.at("link"));
  auto book = open();
  ASSERT_TRUE(book->record(kColours, error)) << error;
  EXPECT_FALSE(open("link"));
  EXPECT_EQ(error, reasonFor("results.json", "is in use already"));

  const pid_t child = ::fork();
  if (child == 0) ::_exit(open() ? 1 : 0);
  int status = -1;
  ASSERT_EQ(::waitpid(child, &status, 0), child);
  EXPECT_EQ(status, 0) << "another program took it";
  EXPECT_TRUE(book->record(kKeys, error)) << error;

  book.reset();
  EXPECT_TRUE(open("link")) << error;
}

TEST_F(Results, RemoveWhatAKilledWriterLeft) {
  scratch.write(".results.json.tmp", "{\"format");
  scratch.write(".results.json.lock", "");
  scratch.write(".results.json.bak.tmp", "another's");
  auto book = open();
  ASSERT_TRUE(book) << error;
  EXPECT_EQ(scratch.names(), (Names{".results.json.lock", ".results.json.bak.tmp"}));
  EXPECT_TRUE(book->record(kColours, error)) << error;
  EXPECT_EQ(scratch.read("results.json"), kDocumented);
}

// Files of this process end after some bytes, as on a full disk.
class FullDisk {
 public:
  explicit FullDisk(rlim_t bytes) : formerAction(std::signal(SIGXFSZ, SIG_IGN)) {
    ::getrlimit(RLIMIT_FSIZE, &former);
    const rlimit limit = {bytes, former.rlim_max};
    ::setrlimit(RLIMIT_FSIZE, &limit);
  }
  ~FullDisk() {
    ::setrlimit(RLIMIT_FSIZE, &former);
    (void)std::signal(SIGXFSZ, formerAction);
  }
  FullDisk(const FullDisk&) = delete;
  FullDisk& operator=(const FullDisk&) = delete;
  FullDisk(FullDisk&&) = delete;
  FullDisk& operator=(FullDisk&&) = delete;

 private:
  void (*formerAction)(int);
  rlimit former = {};
};

TEST_F(Results, SurviveAFullDisk) {
  auto book = open();
  ASSERT_TRUE(book->record(kColours, error)) << error;
  bool isWritten = true;
  {
    const FullDisk disk(std::string_view(kDocumented).size());
    isWritten = book->record(kKeys, error);
  }
  EXPECT_FALSE(isWritten);
  EXPECT_EQ(error, reasonFor("results.json", "cannot be written: File too large"));
  EXPECT_EQ(scratch.read("results.json"), kDocumented);
  EXPECT_EQ(scratch.names(), (Names{".results.json.lock", "results.json"}));
  EXPECT_NE(book->find("keys"), nullptr);

  ASSERT_TRUE(book->record(kColours, error)) << error;
  book.reset();
  EXPECT_EQ(open().value().results(), (std::vector{kColours, kKeys}));
}

TEST_F(Results, SayWhatBecameOfTheirDirectory) {
  fs::create_directory(scratch.at("folder"));
  auto book = open("folder/results.json");
  fs::remove_all(scratch.at("folder"));
  EXPECT_FALSE(book->record(kColours, error));
  EXPECT_EQ(error,
            reasonFor("folder/results.json", "cannot be written: No such file or directory"));
  fs::create_directories(scratch.at("folder/results.json"));
  EXPECT_FALSE(book->record(kColours, error));
  EXPECT_EQ(error, reasonFor("folder/results.json", "is not a regular file"));
}

TEST_F(Results, AreNeverLongerThanCanBeRead) {
  auto book = open();
  ASSERT_TRUE(book->record(kColours, error)) << error;
  TestResult longOne = kKeys;
  longOne.test.assign(kLongestJson, 'x');
  EXPECT_FALSE(book->record(longOne, error));
  EXPECT_EQ(error, reasonFor("results.json", "would be longer than 1048576 bytes"));
  EXPECT_EQ(scratch.read("results.json"), kDocumented);
}

}  // namespace
}  // namespace factory_test
