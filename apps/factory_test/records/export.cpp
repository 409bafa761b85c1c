#include "records/export.h"

#include <array>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string_view>
#include <utility>

#include "results/junit.h"
#include "results/measure_text.h"
#include "results/result_entry.h"
#include "results/utc_time.h"

namespace factory_test {

namespace {

using nlohmann::ordered_json;

constexpr int kHistoryVersion = 1;

ordered_json verdictEntry(const VerdictRecord& verdict) {
  ordered_json entry = {{"id", verdict.id}};
  entry.update(resultEntry(verdict.result));
  return entry;
}

ordered_json runEntry(const RunRecord& run) {
  const RunStart& start = run.start;
  ordered_json entry = {{"id", run.id}};
  if (!start.unit.empty()) entry["unit"] = start.unit;
  entry["station"] = start.station;
  if (!start.operatorName.empty()) entry["operator"] = start.operatorName;
  entry["software"] = start.software;
  entry["plan"] = {{"name", start.planName}, {"hash", start.planHash}, {"tests", start.tests}};
  entry["started"] = utcText(start.started);
  if (run.ended) entry["ended"] = utcText(*run.ended);
  entry["state"] = stateName(run.state);
  ordered_json& results = entry["results"] = ordered_json::array();
  for (const VerdictRecord& each : run.verdicts) results.push_back(verdictEntry(each));
  return entry;
}

std::string csvField(const std::string& text) {
  const bool isFormula = text.find_first_of("=+-@") == 0;
  std::string field = isFormula ? "'" : "";
  for (const char letter : text) field.append(letter == '"' ? 2 : 1, letter);
  if (field.find_first_of(",\"\r\n") == std::string::npos) return field;
  return std::string("\"").append(field).append("\"");
}

// The columns of a run and a verdict, with the comma behind each.
std::string csvVerdict(const RunRecord& run, const VerdictRecord& verdict) {
  const TestResult& result = verdict.result;
  std::string line;
  for (const std::string& text :
       {run.id, run.start.unit, run.start.station, result.operatorName, run.start.software,
        run.start.planName, run.start.planHash, std::string(stateName(run.state)), verdict.id,
        result.test, std::string(verdictName(result.verdict)), utcText(result.started)}) {
    line += csvField(text) + ",";
  }
  return line + std::to_string(result.attempt) + "," + std::to_string(result.duration.count()) +
         ",";
}

std::string limitText(const std::optional<double>& limit) {
  return limit ? numberText(*limit) : "";
}

std::string csvLines(const RunRecord& run, const VerdictRecord& verdict) {
  const std::string before = csvVerdict(run, verdict);
  const std::string behind = std::string(",") + reasonName(verdict.result.reason) + "\r\n";
  if (verdict.result.values.empty()) return before + ",,,," + behind;
  std::string lines;
  for (const Measure& each : verdict.result.values) {
    lines += before;
    for (const std::string& field : {csvField(each.name), csvField(each.unit),
                                     numberText(each.value), limitText(each.least)}) {
      lines += field + ",";
    }
    lines += limitText(each.most) + behind;
  }
  return lines;
}

}  // namespace

std::string historyJson(std::span<const RunRecord> runs) {
  ordered_json list = ordered_json::array();
  for (const RunRecord& run : runs) list.push_back(runEntry(run));
  return jsonText({{"version", kHistoryVersion}, {"runs", std::move(list)}});
}

std::string historyJunit(std::span<const RunRecord> runs) {
  std::vector<std::vector<TestResult>> results;
  for (const RunRecord& run : runs) {
    std::vector<TestResult>& all = results.emplace_back();
    for (const VerdictRecord& each : run.verdicts) all.push_back(each.result);
  }
  std::vector<JunitSuite> suites;
  for (std::size_t i = 0; i < runs.size(); ++i) {
    const RunStart& start = runs[i].start;
    std::string name = start.unit.empty() ? "unknown unit" : start.unit;
    name.append(" ").append(utcText(start.started)).append(" ").append(stateName(runs[i].state));
    suites.push_back({std::move(name), start, results[i]});
  }
  return junitXml(suites);
}

std::string historyCsv(std::span<const RunRecord> runs) {
  std::string text =
      "run,unit,station,operator,software,plan,plan_hash,state,verdict_id,test,verdict,started,"
      "attempt,duration_ms,value_name,value_unit,value,least,most,reason\r\n";
  for (const RunRecord& run : runs) {
    for (const VerdictRecord& verdict : run.verdicts) text += csvLines(run, verdict);
  }
  return text;
}

}  // namespace factory_test
