/// The results of a factory test, and where they are kept.
#pragma once

#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "records/database.h"
#include "records/line.h"
#include "records/run.h"
#include "results/file_lock.h"
#include "results/test_result.h"

namespace factory_test {

/// When a book begins its first run in the database: as it is opened, or with the first
/// startUnit(), as the unit is still to be asked for.
enum class FirstRun { AtOnce, WithUnit };

/// Where results are kept; an empty path: not there.
struct Keeping {
  std::filesystem::path json = {};      // the newest results, see results_json.h
  std::filesystem::path junit = {};     // a report for a CI system, see junit.h
  std::filesystem::path database = {};  // all verdicts of all units, see records/database.h
  Resume resume = Resume::Yes;
  FirstRun first = FirstRun::AtOnce;
  std::string line = {};     // the address of the line's database, see records/line.h; empty: none
  bool isOnlyShown = false;  // the JSON file is read, and nothing is written
};

/// The newest result of each test of one unit, and what keeps them. One thread at a time uses a
/// book; nothing here throws. Where something cannot be written, the results stay in memory, the
/// files hold what they held before, and an error says why in one line that begins with the file's
/// name.
class ResultBook {
 public:
  /// Begins a run, unless the unit is to be told first: with a database as Database::startRun()
  /// does, else with what the file at `places.json` holds, as `places.resume` says. Results of
  /// another unit, unless `start` names none, or of another plan are not gone on with. All files
  /// are written at once, so that one that cannot be is found before the first test. Nothing is
  /// returned for that, for a file that holds such results or that another program keeps its
  /// results in, and for one that cannot be read; `error` then says why, and what is there stays as
  /// it is.
  static std::optional<ResultBook> open(const Keeping& places, const RunStart& start,
                                        std::string& error);
  /// A file alone, or none: the results stay in memory.
  static std::optional<ResultBook> open(const std::filesystem::path& json, std::string& error) {
    return open(Keeping{.json = json}, {}, error);
  }

  /// Saves what is left, ends the run, and begins one of another unit or by another operator, as
  /// open() does. Without a database that works as long as there is no result, since a file holds
  /// those of one unit.
  bool startUnit(const RunStart& start, std::string& error);
  const RunStart& run() const { return begun; }
  /// False while the first unit is still to be told, and once a startUnit() ended the run before,
  /// but failed to begin the next.
  bool hasBegun() const { return isBegun; }

  /// Puts `result`, clamped(), in the place of the test's earlier one, whose attempts it goes on to
  /// count, or at the end, with the run's operator; then writes. False: it goes out with the next
  /// record() or saveAgain(). Waits for the disk, often some milliseconds.
  bool record(TestResult result, std::string& error);

  /// Whether the test has a result, and all that it is kept in holds it.
  bool isSaved(std::string_view test) const;
  bool isAllSaved() const { return areFilesSaved() && unsavedVerdicts.empty() && !isFinishing; }
  /// Tries again to write what could not be written. True: nothing is left unsaved, or was.
  bool saveAgain(std::string& error);

  /// The plan is through, though tests may be left: a failure ended it. Without this a run is
  /// finished once all tests of its plan have a verdict, and aborted when the program ends before.
  /// False: saveAgain() tries this again, too.
  bool finish(std::string& error);

  /// How long an operation may wait for another program that writes into the database.
  void setPatience(std::chrono::milliseconds patience);
  /// Whether what failed last failed for such a program: it works once that is done.
  bool isBusy() const { return database && database->isBusy(); }

  /// Tries a last time, as saveAgain() does, and leaves the run and the database. The line has a
  /// moment to take the rest.
  bool close(std::string& error);

  /// How the line's database is kept up to date: how many verdicts were not sent, and what went
  /// wrong last. Nothing without one. Any thread; also after close().
  std::optional<LineStatus> lineStatus() const;

  /// The test's result, or null. Valid until the next record() or startUnit().
  const TestResult* find(std::string_view test) const;
  /// In the order in which the tests were recorded first. Valid as long.
  const std::vector<TestResult>& results() const { return kept; }

 private:
  explicit ResultBook(Keeping places) : files(std::move(places)) {}

  bool lockFiles(std::string& error);
  bool resumeFile(std::string& error);
  bool begin(const RunStart& start, std::string& error);
  bool goOn(RunStart& wanted, std::string& error);
  void beginAnew();
  bool isComplete(const std::vector<std::string>& tests) const;
  bool areFilesSaved() const { return unsavedTests.empty() && !isEndUnsaved; }
  bool saveDatabase(std::string& error);
  bool saveFiles(std::string& error);
  void put(TestResult result);

  Keeping files;
  std::vector<FileLock> locks = {};
  std::unique_ptr<Line> line = {};
  std::unique_ptr<Database> database = {};  // ends its run before the line does
  RunStart begun = {};
  bool isBegun = false;
  RunState state = RunState::Running;  // as the files say
  bool isFinishing = false;            // the database has yet to take that the plan is through
  bool isEndUnsaved = false;           // the files have
  std::vector<TestResult> kept = {};
  std::vector<TestResult> unsavedVerdicts = {};  // the database has yet to take them, oldest first
  std::vector<std::string> unsavedTests = {};    // the files do not hold their newest result
};

}  // namespace factory_test
