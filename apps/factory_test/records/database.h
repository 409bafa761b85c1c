/// A station's database: units, runs, verdicts and values. docs/factory-line.md shows its tables.
#pragma once

#include <filesystem>
#include <memory>
#include <span>
#include <string>
#include <vector>

#include "records/run.h"
#include "records/run_locks.h"
#include "records/sqlite.h"

namespace factory_test {

/// What one program keeps in the database, a run at a time; several programs may share a file. One
/// thread uses it. Each operation is one transaction, on the disk when it returns; it waits for
/// another writer, for setPatience() at most. False: the database is as it was, and `error` says
/// why in one line that begins with the file's name. Nothing here throws.
class Database {
 public:
  /// Opens or makes it, as prepareDatabase() does.
  static std::unique_ptr<Database> open(const std::filesystem::path& path, std::string& error);
  /// Ends the run as endRun() does, as far as that can be written.
  ~Database();

  /// Ends this program's run, marks those aborted whose programs have died, and begins a run.
  /// Unless `resume` is No it goes on with the unit's newest run instead if that was aborted, under
  /// the same plan and software; `resumed` gets its verdicts, oldest first. `start` is storable().
  bool startRun(const RunStart& start, Resume resume, std::vector<TestResult>& resumed,
                std::string& error);
  /// Adds verdicts to the run. It is finished once all tests of its plan have one.
  bool keep(std::span<const TestResult> results, std::string& error);
  /// The plan is through, though tests may be left.
  bool finishRun(std::string& error);
  /// The program leaves the run: it is aborted unless it is finished.
  bool endRun(std::string& error);

  /// Sqlite::kPatience at first.
  void setPatience(std::chrono::milliseconds patience) { store.setPatience(patience); }
  /// Whether the last operation failed for another writer only.
  bool isBusy() const { return hasMetWriter; }

 private:
  explicit Database(const std::filesystem::path& path);

  template <typename Task>
  bool succeeds(const Task& task, std::string& error);
  void abortDeadRuns();
  void addPlan(const RunStart& start);
  bool takeAborted(const RunStart& start);
  void addRun(const RunStart& start);
  void add(const TestResult& result);
  void closeRun(RunState state);
  void leaveRun();

  Sqlite store;
  RunLocks locks;
  std::int64_t number = 0;  // of the run; 0: none
  std::string run = {};     // its UUID
  bool hasMetWriter = false;
};

}  // namespace factory_test
