#include "records/database.h"

#include "records/database_schema.h"
#include "records/history.h"
#include "records/uuid.h"
#include "results/utc_time.h"

namespace factory_test {

namespace {

// When the run's last verdict was given: nothing is known of it after that.
constexpr auto kLastSign =
    "coalesce((select max(strftime('%Y-%m-%dT%H:%M:%SZ', started, (duration_ms / 1000) || ' "
    "seconds'))"
    " from verdicts where run = runs.id), started)";

constexpr auto kIsComplete =
    "exists (select 1 from plan_tests t where t.plan = runs.plan) and not exists "
    "(select 1 from plan_tests t where t.plan = runs.plan and not exists (select 1 from verdicts v "
    "where v.run = runs.id and v.test = t.test and v.verdict <> 'none'))";

}  // namespace

// Whether `task` ran through; else `error` says why not.
template <typename Task>
bool Database::succeeds(const Task& task, std::string& error) {
  hasMetWriter = false;
  try {
    task();
    return true;
  } catch (const StoreBusy& failure) {
    hasMetWriter = true;
    error = failure.what();
  } catch (const StoreError& failure) {
    error = failure.what();
  }
  return false;
}

Database::Database(const std::filesystem::path& path)
    : store(path, Sqlite::Mode::Write), locks(path) {
  prepareDatabase(store, path);
}

std::unique_ptr<Database> Database::open(const std::filesystem::path& path, std::string& error) {
  try {
    return std::unique_ptr<Database>(new Database(path));
  } catch (const StoreError& failure) {
    error = failure.what();
    return {};
  }
}

Database::~Database() {
  std::string unused;  // the next program marks the run
  endRun(unused);
}

bool Database::startRun(const RunStart& start, Resume resume, std::vector<TestResult>& resumed,
                        std::string& error) {
  if (!endRun(error)) return false;
  const auto begin = [&] {
    Transaction transaction(store);
    abortDeadRuns();
    addPlan(start);
    if (resume == Resume::No || !takeAborted(start)) addRun(start);
    transaction.commit();
    for (const RunRecord& each : readHistory(queryOf(store), {.run = run})) {
      for (const VerdictRecord& verdict : each.verdicts) resumed.push_back(verdict.result);
    }
  };
  if (succeeds(begin, error)) return true;
  leaveRun();
  return false;
}

void Database::abortDeadRuns() {
  std::vector<std::int64_t> dead;
  store.run("select number from runs where state = 'running'", {}, [&](const Cells& row) {
    const std::int64_t candidate = std::stoll(row.front().value_or("0"));
    if (!locks.isHeld(candidate)) dead.push_back(candidate);
  });
  const std::string abort =
      std::string("update runs set state = 'aborted', ended = ") + kLastSign + " where number = ?";
  for (const std::int64_t each : dead) store.run(abort.c_str(), {each});
}

void Database::addPlan(const RunStart& start) {
  store.run("insert into plans values (?, ?) on conflict do nothing",
            {start.planHash, start.planName});
  std::int64_t position = 0;
  for (const std::string& test : start.tests) {
    store.run("insert into plan_tests values (?, ?, ?) on conflict do nothing",
              {start.planHash, ++position, test});
  }
  if (start.unit.empty()) return;
  store.run("insert into units values (?, ?) on conflict do nothing",
            {start.unit, utcText(start.started)});
}

// Runs of units without a number are of different ones. Rehearsals are no part of a unit's way.
bool Database::takeAborted(const RunStart& start) {
  if (start.unit.empty() || start.planName.ends_with(kRehearsal)) return false;
  store.run(
      "select number, id, state = 'aborted' and plan = ? and software = ? from runs "
      "where unit is ? and (select name not like '%' || ? from plans where hash = plan) "
      "order by number desc limit 1",
      {start.planHash, start.software, orNull(start.unit), std::string(kRehearsal)},
      [&](const Cells& row) {
        const std::int64_t newest = std::stoll(row[0].value_or("0"));
        if (row[2] != "1" || !locks.take(newest)) return;
        number = newest;
        run = row[1].value_or("");
      });
  if (number == 0) return false;
  store.run("update runs set state = 'running', ended = null where number = ?", {number});
  return true;
}

void Database::addRun(const RunStart& start) {
  run = newUuid();
  store.run(
      "insert into runs (id, unit, plan, station, operator, software, started, state) "
      "values (?, ?, ?, ?, ?, ?, ?, 'running')",
      {run, orNull(start.unit), start.planHash, start.station, orNull(start.operatorName),
       start.software, utcText(start.started)});
  number = store.number("select last_insert_rowid()");
  locks.takeNew(number);  // before the commit: others would take the run for a dead program's
}

bool Database::keep(std::span<const TestResult> results, std::string& error) {
  const auto write = [&] {
    Transaction transaction(store);
    for (const TestResult& each : results) add(each);
    store.run((std::string("update runs set state = 'finished', ended = ") + kLastSign +
               " where number = ? and " + kIsComplete)
                  .c_str(),
              {number});
    transaction.commit();
  };
  return succeeds(write, error);
}

void Database::add(const TestResult& result) {
  const std::string id = newUuid();
  store.run(
      "insert into verdicts values (?1, ?2, "
      "(select coalesce(max(number), 0) + 1 from verdicts where run = ?2), "
      "?3, ?4, ?5, ?6, ?7, ?8, ?9, ?10, ?11)",
      {id, run, storable(result.test), result.attempt, verdictName(result.verdict),
       utcText(result.started), std::int64_t{result.duration.count()}, result.screen.width,
       result.screen.height, orNull(result.operatorName), orNull(reasonName(result.reason))});
  std::int64_t position = 0;
  for (const Measure& each : result.values) {
    store.run("insert into measures values (?, ?, ?, ?, ?, ?, ?)",
              {id, ++position, storable(each.name), storable(each.unit), each.value,
               orNull(each.least), orNull(each.most)});
  }
}

bool Database::finishRun(std::string& error) {
  return succeeds([this] { closeRun(RunState::Finished); }, error);
}

bool Database::endRun(std::string& error) {
  if (number == 0) return true;
  if (!succeeds([this] { closeRun(RunState::Aborted); }, error)) return false;
  leaveRun();
  return true;
}

void Database::leaveRun() {
  locks.release(number);
  number = 0;
  run.clear();
}

// A run that has ended already stays as it is.
void Database::closeRun(RunState state) {
  store.run((std::string("update runs set state = ?, ended = ") + kLastSign +
             " where number = ? and state = 'running'")
                .c_str(),
            {stateName(state), number});
}

}  // namespace factory_test
