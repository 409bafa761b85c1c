#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <netinet/in.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <fstream>
#include <iterator>

#include "records/database_schema.h"
#include "records/history.h"
#include "results/results.h"
#include "support/eventually.h"

namespace factory_test {
namespace {

namespace fs = std::filesystem;
using testing::ElementsAre;

constexpr std::chrono::sys_seconds kMorning(std::chrono::seconds(1'795'244'400));

RunStart startOf(const std::string& unit) {
  return {unit, "Ann", "Line A", "hash", {"keys", "touch"}, "1.0", "bench7", kMorning};
}

TestResult resultOf(const std::string& test, Verdict verdict, int attempt = 1) {
  const Measure distance = {"worst distance", "mm", 0.1, {}, 2.5};
  return {test,       verdict,    kMorning, std::chrono::milliseconds(4200),
          {480, 800}, {distance}, attempt,  Reason::Unknown,
          "Ann"};
}
const TestResult kKeys = resultOf("keys", Verdict::Pass);
const TestResult kTouch = resultOf("touch", Verdict::Fail);

class Records : public testing::Test {
 protected:
  Records() { fs::create_directory(folder); }
  ~Records() override { fs::remove_all(folder); }

  std::optional<ResultBook> open(const RunStart& start) {
    return ResultBook::open({.database = file}, start, error);
  }
  // What the database says of its runs, read as others read it.
  std::vector<RunRecord> history() const {
    Sqlite store(file, Sqlite::Mode::Read);
    EXPECT_EQ(store.cell("pragma integrity_check"), "ok");
    return readHistory(queryOf(store), {});
  }
  std::vector<std::string> states() const {
    std::vector<std::string> words;
    for (const RunRecord& run : history()) words.emplace_back(stateName(run.state));
    return words;
  }

  const fs::path folder = testing::TempDir() + "records_test." + std::to_string(::getpid());
  const fs::path file = folder / "station.db";
  std::string error;
};

// Runs `task` in a process of its own and says how it ended.
template <typename Task>
int inChild(const Task& task) {
  const pid_t child = ::fork();
  if (child == 0) {
    task();
    ::_exit(0);
  }
  int end = 0;
  ::waitpid(child, &end, 0);
  return end;
}

TEST_F(Records, GoOnWithTheUnitsAbortedRunOnly) {
  ASSERT_TRUE(open(startOf("A1"))->record(kKeys, error)) << error;
  struct Other {
    const char* name;
    RunStart start;
    Resume resume;
  };
  RunStart plan = startOf("A1");
  plan.planHash = "other";
  RunStart software = startOf("A1");
  software.software = "1.1";
  RunStart rehearsal = startOf("A1");
  rehearsal.planName += kRehearsal;
  rehearsal.planHash = "rehearsed";
  for (int times = 0; times < 2; ++times) {
    auto book = open(rehearsal);
    EXPECT_TRUE(book->results().empty() && book->record(kKeys, error)) << error;
  }
  for (const auto& [name, start, resume] : std::vector<Other>{
           {"its run", startOf("A1"), Resume::Yes},
           {"another unit's", startOf("A2"), Resume::Yes},
           {"no unit's", startOf(""), Resume::Yes},
           {"not wanted", startOf("A1"), Resume::No},
       }) {
    const auto book = ResultBook::open({.database = file, .resume = resume}, start, error);
    ASSERT_TRUE(book) << error;
    EXPECT_EQ(book->results().size(), name == std::string("its run") ? 1U : 0U) << name;
  }
  EXPECT_EQ(open(plan)->results().size(), 0U);
  EXPECT_EQ(open(software)->results().size(), 0U);
}

TEST_F(Records, AreFinishedWithTheirPlan) {
  ASSERT_TRUE(open(startOf("B1"))->record(kKeys, error));
  auto book = open(startOf("B1"));
  EXPECT_EQ(book->results(), std::vector{kKeys});
  ASSERT_TRUE(book->record(kKeys, error)) << error;
  EXPECT_THAT(states(), ElementsAre("running"));
  ASSERT_TRUE(book->record(kTouch, error)) << error;
  EXPECT_THAT(states(), ElementsAre("finished")) << "with the plan's last test";
  ASSERT_TRUE(book->startUnit(startOf("B1"), error)) << error;
  EXPECT_TRUE(book->results().empty());
  EXPECT_TRUE(book->finish(error)) << "a failure ended the plan";
  book.reset();
  EXPECT_THAT(states(), ElementsAre("finished", "finished"));
  const auto runs = history();
  const RunRecord& run = runs[0].verdicts.empty() ? runs[1] : runs[0];
  EXPECT_EQ(run.start.tests, startOf("").tests);
  EXPECT_EQ(run.ended, kMorning + std::chrono::seconds(4));
  ASSERT_EQ(run.verdicts.size(), 3U);
  EXPECT_EQ(run.verdicts[0].result, kKeys);
  EXPECT_EQ(run.verdicts[1].result, resultOf("keys", Verdict::Pass, 2));
}

TEST_F(Records, NameWhoGaveEachVerdictAndWhy) {
  RunStart start = startOf("B1");
  ASSERT_TRUE(open(start)->record(kTouch, error));
  for (const auto& [name, reason] :
       {std::pair("Bob", Reason::TimeOut), {"", Reason::Limit}, {"Cem", Reason::Rehearsal}}) {
    start.operatorName = name;
    TestResult result = kTouch;
    result.reason = reason;
    result.operatorName = "";
    ASSERT_TRUE(open(start)->record(result, error)) << error;
  }
  const RunRecord run = history().at(0);
  EXPECT_EQ(run.start.operatorName, "Ann");
  std::vector<std::string> said;
  for (const VerdictRecord& each : run.verdicts) {
    said.push_back(each.result.operatorName + " " + reasonName(each.result.reason));
  }
  EXPECT_THAT(said, ElementsAre("Ann ", "Bob time-out", " limit", "Cem rehearsal"));
}

TEST_F(Records, KnowARunThatADeadProgramLeft) {
  auto living = open(startOf("A1"));
  ASSERT_TRUE(living) << error;
  const int end = inChild([this] {
    auto book = open(startOf("A2"));
    book->record(kKeys, error);
    ::raise(SIGKILL);
  });
  ASSERT_TRUE(WIFSIGNALED(end));
  EXPECT_THAT(states(), ElementsAre("running", "running"));
  fs::create_symlink(file, folder / "link.db");
  const auto next = ResultBook::open({.database = folder / "link.db"}, startOf("A3"), error);
  ASSERT_TRUE(next) << error;
  EXPECT_THAT(states(), testing::UnorderedElementsAre("running", "aborted", "running"));
  const auto resumed = open(startOf("A2"));
  EXPECT_EQ(resumed->results(), std::vector{kKeys});
  // A run that a living program holds is nobody else's.
  EXPECT_TRUE(open(startOf("A1"))->results().empty());
  EXPECT_TRUE(living->record(kKeys, error));
}

TEST_F(Records, DoNotBeginARunThatAnotherProgramHolds) {
  ASSERT_TRUE(open(startOf("A1")));
  const int descriptor = ::open((file.native() + ".lock").c_str(), O_RDWR | O_CLOEXEC);
  struct flock second = {F_WRLCK, SEEK_SET, 2, 1, 0};
  ASSERT_EQ(::fcntl(descriptor, F_OFD_SETLK, &second), 0);
  EXPECT_FALSE(open(startOf("A2")));
  EXPECT_EQ(error, file.native() + ".lock: another program holds run 2");
  ::close(descriptor);
  EXPECT_THAT(states(), ElementsAre("aborted"));
}

TEST_F(Records, GoToAFileWhateverItsName) {
  const fs::path before = fs::current_path();
  fs::current_path(folder);
  for (const fs::path name : {":memory:", "file:x?mode=memory"}) {
    EXPECT_TRUE(ResultBook::open({.database = name}, startOf("A1"), error)->record(kKeys, error));
    EXPECT_EQ(ResultBook::open({.database = name}, startOf("A1"), error)->results().size(), 1U);
  }
  fs::current_path(before);
}

TEST_F(Records, TakeSeveralProgramsAtOnce) {
  constexpr int kPrograms = 8;
  constexpr int kVerdicts = 5;
  std::vector<pid_t> children;
  std::array<int, 2> gate = {};
  ASSERT_EQ(::pipe2(gate.data(), O_CLOEXEC), 0);
  for (int program = 0; program < kPrograms; ++program) {
    children.push_back(::fork());
    if (children.back() != 0) continue;
    ::close(gate[1]);
    char unused = 0;
    while (::read(gate[0], &unused, 1) > 0) {
    }
    auto book = open(startOf("A" + std::to_string(program)));
    for (int i = 0; book && i < kVerdicts; ++i) {
      if (!book->record(kKeys, error)) ::_exit(1);
    }
    ::_exit(book ? 0 : 1);
  }
  for (const int each : gate) ::close(each);  // all begin the same new database now
  for (const pid_t child : children) {
    int end = 0;
    ::waitpid(child, &end, 0);
    EXPECT_EQ(end, 0);
  }
  ASSERT_EQ(history().size(), kPrograms);
  for (const RunRecord& run : history()) EXPECT_EQ(run.verdicts.size(), kVerdicts);
}

class OldRecords : public Records, public testing::WithParamInterface<int> {};

TEST_P(OldRecords, AreMigratedWithABackup) {
  const std::string old = std::to_string(GetParam());
  std::ifstream dump(RECORDS + old + ".sql");
  const std::string sql((std::istreambuf_iterator<char>(dump)), {});
  Sqlite(file, Sqlite::Mode::Write).runAll(sql.c_str());
  const std::string backup = file.native() + ".v" + old + ".bak";
  fs::create_symlink(fs::path(backup).filename(), backup);  // in the way, and a loop
  fs::create_symlink(file, folder / "link.db");
  ASSERT_TRUE(ResultBook::open({.database = folder / "link.db"}, startOf("C1"), error)) << error;
  for (const auto& [path, version] : {std::pair(file, 4), {backup + ".2", GetParam()}}) {
    Sqlite store(path, Sqlite::Mode::Read);
    EXPECT_EQ(store.number("pragma user_version"), version);
    const auto runs = readHistory(queryOf(store), {.unit = "OLD 1"});
    ASSERT_EQ(runs.size(), 1U);
    EXPECT_EQ(runs[0].verdicts.at(1).result.operatorName, version == 4 ? "Eve" : "");
    EXPECT_EQ(runs[0].verdicts.at(1).result.values.at(0), (Measure{"gap", "mm", 0.25, {}, 1.5}));
  }
  Sqlite store(file, Sqlite::Mode::Read);
  EXPECT_EQ(store.number("select count(*) from changes where verdict is not null"), 2);
  EXPECT_EQ(store.number("select revision from runs where unit = 'OLD 1'"), 1);
}

INSTANTIATE_TEST_SUITE_P(All, OldRecords, testing::Values(1, 2, 3));

TEST_F(Records, AreReadWithoutLeavingAFile) {
  const fs::path odd = folder / "100%?#.db";
  ASSERT_TRUE(ResultBook::open({.database = odd}, startOf("A1"), error)->record(kKeys, error));
  const auto expectVerdicts = [&](std::size_t count) {
    const auto files = [this] {
      return std::distance(fs::directory_iterator(folder), fs::directory_iterator());
    };
    const auto before = files();
    readUndisturbed(odd, [&] {
      Sqlite store(odd, Sqlite::Mode::Read);
      EXPECT_EQ(readHistory(queryOf(store), {}).at(0).verdicts.size(), count);
    });
    EXPECT_EQ(files(), before);
  };
  expectVerdicts(1);
  inChild([&] {
    auto book = ResultBook::open({.database = odd}, startOf("A1"), error);
    book->record(kKeys, error);
    ::raise(SIGKILL);
  });
  expectVerdicts(2);  // from the log that was left
  fs::remove(odd.native() + "-shm");
  expectVerdicts(2);
  const int end = inChild([&] {
    fs::permissions(folder, fs::perms(0555));
    if (::setuid(65'534) != 0 && ::getuid() == 0) ::_exit(2);
    expectVerdicts(2);
    ::_exit(HasFailure() ? 1 : 0);
  });
  EXPECT_EQ(end, 0) << "a folder that cannot be written";
  fs::permissions(folder, fs::perms::owner_all);
  int reads = 0;
  readUndisturbed(odd, [&] {
    if (++reads == 1) (void)ResultBook::open({.database = odd}, startOf("A2"), error);
  });
  EXPECT_EQ(reads, 2) << "somebody wrote meanwhile";
}

TEST_F(Records, ThatCannotBeUsedAreNamedAndLeftAsTheyAre) {
  ASSERT_TRUE(open(startOf("A1"))->record(kKeys, error));
  const auto damage = [this](std::streamoff at, const std::string& bytes) {
    std::fstream(file).seekp(at).write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
  };
  const auto run = [this](const char* sql) { Sqlite(file, Sqlite::Mode::Write).runAll(sql); };
  struct Case {
    const char* says;
    std::function<void()> prepare;
  };
  for (const auto& [says, prepare] : std::vector<Case>{
           {"is of version 5, newer than this program's 4",
            [&] { run("pragma user_version = 5"); }},
           {"has lost its version: put it aside, then begin a new one",
            [&] { run("pragma user_version = 0"); }},
           {"is another program's database", [&] { run("pragma application_id = 7"); }},
           {"is damaged; put it aside, then begin a new one",
            [&] {
              run("pragma application_id = 1179927618; pragma user_version = 4");
              for (std::streamoff page = 1; page < 30; ++page)
                damage(page * 4096, std::string(64, '\x7f'));
            }},
           {"is not a database", [&] { damage(0, "no database at all"); }},
           {"cannot be opened: Is a directory",
            [&] { fs::remove(file), fs::create_directory(file); }},
       }) {
    prepare();
    const auto size = fs::is_directory(file) ? 0 : fs::file_size(file);
    EXPECT_FALSE(open(startOf("A1"))) << says;
    EXPECT_EQ(error, file.native() + ": " + says);
    EXPECT_EQ(fs::is_directory(file) ? 0 : fs::file_size(file), size);
  }
}

TEST_F(Records, SayWhereTheyCannotBeWritten) {
  EXPECT_FALSE(ResultBook::open({.database = folder / "none" / "x.db"}, {}, error));
  EXPECT_THAT(error,
              testing::EndsWith("/none/x.db: cannot be opened: it or its folder is missing"));
  fs::create_symlink(folder / "victim", file.native() + ".lock");
  EXPECT_FALSE(open(startOf("A1")));
  EXPECT_THAT(error, testing::EndsWith(".lock: is a symbolic link"));
  EXPECT_FALSE(fs::exists(folder / "victim"));
  fs::remove(file.native() + ".lock");
  fs::remove(file);
  const int end = inChild([this] {
    fs::permissions(folder, fs::perms::owner_read | fs::perms::owner_exec);
    if (::setuid(65'534) != 0 && ::getuid() == 0) ::_exit(2);
    const bool isRefused =
        !open(startOf("A1")) &&
        error == file.native() + ": cannot be made in its folder: this user has no right to";
    ::_exit(isRefused ? 0 : 1);
  });
  EXPECT_EQ(end, 0) << "a folder that cannot be written";
  fs::permissions(folder, fs::perms::owner_all);
}

TEST_F(Records, SurviveAFullDiskAndALock) {
  RunStart longer = startOf("A1");
  longer.tests.emplace_back("pinch");
  auto book = ResultBook::open({.json = folder / "all.json", .database = file}, longer, error);
  ASSERT_TRUE(book && book->record(kKeys, error)) << error;
  // Files of this process end after some bytes, as on a full disk.
  (void)std::signal(SIGXFSZ, SIG_IGN);
  rlimit former = {};
  ::getrlimit(RLIMIT_FSIZE, &former);
  const rlimit little = {4096, former.rlim_max};
  ::setrlimit(RLIMIT_FSIZE, &little);
  const bool isWritten = book->record(kTouch, error);
  ::setrlimit(RLIMIT_FSIZE, &former);
  EXPECT_FALSE(isWritten);
  EXPECT_THAT(error, testing::StartsWith(file.native() + ": cannot be read or written"));
  EXPECT_FALSE(book->isSaved("touch"));
  EXPECT_TRUE(book->isSaved("keys"));
  EXPECT_EQ(history().at(0).verdicts.size(), 1U);
  {
    Sqlite other(file, Sqlite::Mode::Write);
    const Transaction lock(other);
    book->setPatience(std::chrono::milliseconds(1));
    EXPECT_FALSE(book->saveAgain(error));
    EXPECT_EQ(error, file.native() + ": is locked by another program");
    EXPECT_FALSE(book->finish(error));
    EXPECT_TRUE(book->isBusy());
  }
  EXPECT_TRUE(book->saveAgain(error) && book->saveAgain(error)) << error;
  EXPECT_TRUE(book->isAllSaved() && book->isSaved("touch"));
  EXPECT_EQ(history().at(0).verdicts.size(), 2U) << "once each";
  EXPECT_THAT(states(), ElementsAre("finished"));
}

// A server that takes connections and says nothing. Its address.
class SilentServer {
 public:
  SilentServer() {
    EXPECT_EQ(::bind(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
    ::listen(socket, 1);
    socklen_t length = sizeof address;
    ::getsockname(socket, reinterpret_cast<sockaddr*>(&address), &length);
  }
  ~SilentServer() { ::close(socket); }
  SilentServer(const SilentServer&) = delete;
  SilentServer& operator=(const SilentServer&) = delete;

  std::string url() const {
    return "postgresql://127.0.0.1:" + std::to_string(ntohs(address.sin_port)) + "/line";
  }

 private:
  int socket = ::socket(AF_INET, SOCK_STREAM, 0);
  sockaddr_in address = {AF_INET, 0, {htonl(INADDR_LOOPBACK)}, {}};
};

TEST_F(Records, SayWhatASilentLineDoesNotTake) {
  ASSERT_TRUE(open(startOf("A1"))->record(kKeys, error));
  {
    Sqlite store(file, Sqlite::Mode::Write);  // all went to another line
    store.runAll("insert into lines values ('other', 1000, 'host=other ')");
  }
  const SilentServer server;
  int waiting = 1;
  for (const auto& [url, why] :
       {std::pair(server.url(), "has not answered in time"),
        std::pair<std::string, const char*>("postgresql://127.0.0.1:1/line", "refused")}) {
    auto book = ResultBook::open({.database = file, .line = url}, startOf("A2"), error);
    ASSERT_TRUE(book && book->record(kKeys, error)) << error;
    EXPECT_TRUE(url == server.url() ||
                brimol::test::eventually([&] { return !book->lineStatus()->error.empty(); }));
    EXPECT_TRUE(book->close(error)) << error;
    EXPECT_EQ(book->lineStatus()->waiting, ++waiting);
    EXPECT_THAT(book->lineStatus()->error, testing::HasSubstr(why));
  }
  EXPECT_THAT(states(), ElementsAre("aborted", "aborted"));
}

}  // namespace
}  // namespace factory_test
