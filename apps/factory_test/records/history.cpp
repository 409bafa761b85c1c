#include "records/history.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <map>
#include <unordered_map>
#include <utility>

#include "results/utc_time.h"

namespace factory_test {

namespace {

// The columns of a row, from left to right.
class Columns {
 public:
  explicit Columns(const Cells& cells) : row(cells) {}

  // Empty for a column that databases of older versions do not have.
  std::string text() {
    const std::size_t place = next++;
    return place < row.size() ? row[place].value_or("") : "";
  }
  int count() { return parsed<int>(text()).value_or(0); }
  double figure() { return parsed<double>(text()).value_or(0); }
  std::optional<double> limit() { return parsed<double>(text()); }
  // "2026-11-21T07:00:00Z"; a line's database says "2026-11-21 07:00:00+00".
  std::optional<std::chrono::sys_seconds> time() {
    std::string written = text();
    std::ranges::replace(written, ' ', 'T');
    if (written.ends_with("+00")) written.replace(written.size() - 3, 3, "Z");
    return parseUtc(written);
  }

 private:
  template <typename Number>
  static std::optional<Number> parsed(const std::string& text) {
    Number number = {};
    const auto [end, failure] = std::from_chars(text.data(), text.data() + text.size(), number);
    return text.empty() || failure != std::errc() ? std::nullopt : std::optional(number);
  }

  const Cells& row;
  std::size_t next = 0;
};

template <typename Kind, std::size_t Count>
Kind kindNamed(const std::string& name, const std::array<Kind, Count>& kinds,
               const char* (*nameOf)(Kind)) {
  const auto found = std::ranges::find_if(kinds, [&](Kind kind) { return nameOf(kind) == name; });
  return found == kinds.end() ? kinds.front() : *found;
}

struct Choice {
  std::string where = {};
  std::vector<std::string> parameters = {};

  void add(const char* condition, const std::string& value) {
    if (value.empty()) return;
    parameters.push_back(value);
    where += (where.empty() ? " where " : " and ") + std::string(condition) + " $" +
             std::to_string(parameters.size());
  }
};

RunRecord runOf(const Cells& row) {
  Columns columns(row);
  RunRecord run;
  run.id = columns.text();
  run.start.unit = columns.text();
  run.start.operatorName = columns.text();
  run.start.planHash = columns.text();
  run.start.planName = columns.text();
  run.start.software = columns.text();
  run.start.station = columns.text();
  run.start.started = columns.time().value_or(run.start.started);
  run.ended = columns.time();
  run.state =
      kindNamed(columns.text(),
                std::array{RunState::Running, RunState::Finished, RunState::Aborted}, stateName);
  return run;
}

constexpr std::size_t kRunColumn = 1;  // of a verdict

VerdictRecord verdictOf(const Cells& row) {
  Columns columns(row);
  VerdictRecord record;
  TestResult& result = record.result;
  record.id = columns.text();
  columns.text();  // the run
  columns.text();  // its number in the run
  result.test = columns.text();
  result.attempt = columns.count();
  result.verdict = kindNamed(columns.text(),
                             std::array{Verdict::None, Verdict::Pass, Verdict::Fail}, verdictName);
  result.started = columns.time().value_or(result.started);
  result.duration = std::chrono::milliseconds(columns.count());
  result.screen.width = columns.count();
  result.screen.height = columns.count();
  result.operatorName = columns.text();
  result.reason = kindNamed(columns.text(), kReasons, reasonName);
  return record;
}

// Without the verdict, which is the row's first column.
Measure measureOf(const Cells& row) {
  Columns columns(row);
  columns.text();
  Measure measure;
  measure.name = columns.text();
  measure.unit = columns.text();
  measure.value = columns.figure();
  measure.least = columns.limit();
  measure.most = columns.limit();
  return measure;
}

std::vector<RunRecord> readRuns(const Query& ask, const Choice& choice) {
  std::map<std::string, std::vector<std::string>> plans;
  ask("select plan, test from plan_tests order by plan, position", {},
      [&](const Cells& row) { plans[row[0].value_or("")].push_back(row[1].value_or("")); });
  std::vector<RunRecord> runs;
  ask("select r.id, r.unit, r.operator, r.plan, p.name, r.software, r.station, r.started, r.ended, "
      "r.state from runs r join plans p on p.hash = r.plan" +
          choice.where + " order by r.started, r.id",
      choice.parameters, [&](const Cells& row) {
        runs.push_back(runOf(row));
        runs.back().start.tests = plans[runs.back().start.planHash];
      });
  return runs;
}

void readVerdicts(const Query& ask, const Choice& choice, std::vector<RunRecord>& runs) {
  std::unordered_map<std::string, RunRecord*> byId;
  for (RunRecord& run : runs) byId[run.id] = &run;
  // In the order of the tables, which only ever grow at their end.
  ask("select v.* from verdicts v join runs r on r.id = v.run" + choice.where +
          " order by v.run, v.number",
      choice.parameters, [&](const Cells& row) {
        const auto run = byId.find(row.at(kRunColumn).value_or(""));
        if (run != byId.end()) run->second->verdicts.push_back(verdictOf(row));
      });
}

void readMeasures(const Query& ask, const Choice& choice, std::vector<RunRecord>& runs) {
  std::unordered_map<std::string, TestResult*> byId;
  for (RunRecord& run : runs) {
    for (VerdictRecord& verdict : run.verdicts) byId[verdict.id] = &verdict.result;
  }
  ask("select m.verdict, m.name, m.unit, m.value, m.least, m.most from measures m "
      "join verdicts v on v.id = m.verdict join runs r on r.id = v.run" +
          choice.where + " order by m.verdict, m.position",
      choice.parameters, [&](const Cells& row) {
        const auto verdict = byId.find(row.front().value_or(""));
        if (verdict != byId.end()) verdict->second->values.push_back(measureOf(row));
      });
}

}  // namespace

std::vector<RunRecord> readHistory(const Query& ask, const HistoryFilter& filter) {
  Choice choice;
  choice.add("r.id =", filter.run);
  choice.add("r.unit =", filter.unit);
  choice.add("cast(r.started as text) >=", filter.since);
  std::vector<RunRecord> runs = readRuns(ask, choice);
  readVerdicts(ask, choice, runs);
  readMeasures(ask, choice, runs);
  return runs;
}

Query queryOf(Sqlite& store) {
  return [&store](const std::string& sql, const std::vector<std::string>& parameters,
                  const RowReader& reader) {
    const std::vector<Sqlite::Value> values(parameters.begin(), parameters.end());
    store.run(sql.c_str(), Sqlite::Values(values), reader);
  };
}

}  // namespace factory_test
