#include "results/results_json.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <limits>
#include <utility>

#include "results/result_entry.h"
#include "results/utc_time.h"
#include "utf8.h"

namespace factory_test {

namespace {

using nlohmann::json;
using nlohmann::ordered_json;

constexpr int kIndent = 2;
constexpr int kVersion = 2;
constexpr int kFirstVersion = 1;  // of the files that say none

// A member of an object. Null: it is missing, or `object` is none. Not by value: a copy of what is
// nested very deep would overflow the stack.
const json& memberOf(const json& object, const char* name) {
  static const json null;
  const auto found = object.find(name);
  return found == object.end() ? null : *found;
}

// Each returns false for a value of another type or out of its range.

bool readCount(const json& value, int& count) {
  constexpr auto kMost = std::numeric_limits<int>::max();
  if (!value.is_number_unsigned() || value.get<uint64_t>() > kMost) return false;
  count = value.get<int>();
  return true;
}

bool readText(const json& value, std::string& text) {
  if (!value.is_string()) return false;
  text = value.get<std::string>();
  return true;
}

bool readTest(const json& value, TestResult& result) { return readText(value, result.test); }

bool readVerdict(const json& value, TestResult& result) {
  for (const auto verdict : {Verdict::None, Verdict::Pass, Verdict::Fail}) {
    if (value != verdictName(verdict)) continue;
    result.verdict = verdict;
    return true;
  }
  return false;
}

bool readStarted(const json& value, TestResult& result) {
  const auto time = value.is_string() ? parseUtc(value.get<std::string>()) : std::nullopt;
  result.started = time.value_or(result.started);
  return time.has_value();
}

bool readDuration(const json& value, TestResult& result) {
  int count = 0;
  const bool isRead = readCount(value, count);
  result.duration = std::chrono::milliseconds(count);
  return isRead;
}

bool readScreen(const json& value, TestResult& result) {
  return readCount(memberOf(value, "width"), result.screen.width) &&
         readCount(memberOf(value, "height"), result.screen.height);
}

bool readAttempt(const json& value, TestResult& result) {
  return value.is_null() || (readCount(value, result.attempt) && result.attempt > 0);
}

bool readReason(const json& value, TestResult& result) {
  if (value.is_null()) return true;
  for (const Reason reason : kReasons) {
    if (reason == Reason::Unknown || value != reasonName(reason)) continue;
    result.reason = reason;
    return true;
  }
  return false;
}

bool readOperator(const json& value, TestResult& result) {
  return value.is_null() || readText(value, result.operatorName);
}

bool readLimit(const json& value, std::optional<double>& limit) {
  if (value.is_number()) limit = value.get<double>();
  return value.is_number() || value.is_null();
}

bool readMeasure(const json& entry, Measure& measure) {
  const json& value = memberOf(entry, "value");
  if (!value.is_number()) return false;
  measure.value = value.get<double>();
  return readText(memberOf(entry, "name"), measure.name) &&
         readText(memberOf(entry, "unit"), measure.unit) &&
         readLimit(memberOf(entry, "least"), measure.least) &&
         readLimit(memberOf(entry, "most"), measure.most);
}

bool readValues(const json& value, TestResult& result) {
  if (value.is_null()) return true;
  if (!value.is_array()) return false;
  result.values.resize(value.size());
  return std::ranges::equal(value, result.values, readMeasure);
}

template <typename Owner>
struct Member {
  const char* name;
  bool (*read)(const json& value, Owner& owner);
};
constexpr auto kMembers = std::to_array<Member<TestResult>>({
    {"test", readTest},
    {"verdict", readVerdict},
    {"reason", readReason},
    {"operator", readOperator},
    {"attempt", readAttempt},
    {"started", readStarted},
    {"duration_ms", readDuration},
    {"screen", readScreen},
    {"values", readValues},
});

// The name of the first member that is missing or wrong. Null: none is.
template <typename Owner>
const char* readMembers(const json& entry, std::span<const Member<Owner>> members, Owner& owner) {
  for (const auto& [name, read] : members) {
    if (!read(memberOf(entry, name), owner)) return name;
  }
  return nullptr;
}

ordered_json measureEntry(const Measure& measure) {
  ordered_json entry = {{"name", measure.name}, {"unit", measure.unit}, {"value", measure.value}};
  if (measure.least) entry["least"] = *measure.least;
  if (measure.most) entry["most"] = *measure.most;
  return entry;
}

bool readUnit(const json& value, ResultFile& file) {
  return value.is_null() || readText(value, file.run.unit);
}

bool readPlan(const json& value, ResultFile& file) {
  return value.is_null() || (readText(memberOf(value, "name"), file.run.planName) &&
                             readText(memberOf(value, "hash"), file.run.planHash));
}

bool readState(const json& value, ResultFile& file) {
  if (value == stateName(RunState::Finished)) file.state = RunState::Finished;
  return value.is_null() || file.state == RunState::Finished;
}

constexpr auto kFileMembers = std::to_array<Member<ResultFile>>({
    {"unit", readUnit},
    {"plan", readPlan},
    {"state", readState},
});

// Nothing but a version that is known may be read; a newer program's file would lose by it.
bool checkVersion(const json& root, std::string& reason) {
  const json& member = memberOf(root, "version");
  int version = kFirstVersion;
  if (!member.is_null() && (!readCount(member, version) || version < kFirstVersion)) {
    reason = "has no valid \"version\"";
    return false;
  }
  if (version > kVersion) {
    reason = "is of version " + std::to_string(version) + ", newer than this program's " +
             std::to_string(kVersion);
  }
  return version <= kVersion;
}

bool readResults(const json& list, std::vector<TestResult>& results, std::string& reason) {
  results.resize(list.size());
  for (std::size_t i = 0; i < results.size(); ++i) {
    if (const char* const wrong = readMembers<TestResult>(list[i], kMembers, results[i])) {
      reason = "result " + std::to_string(i + 1) + " has no valid \"" + wrong + "\"";
      return false;
    }
  }
  return true;
}

}  // namespace

ordered_json resultEntry(const TestResult& result) {
  ordered_json values = ordered_json::array();
  for (const Measure& each : result.values) values.push_back(measureEntry(each));
  ordered_json entry = {{"test", result.test}, {"verdict", verdictName(result.verdict)}};
  if (result.reason != Reason::Unknown) entry["reason"] = reasonName(result.reason);
  if (!result.operatorName.empty()) entry["operator"] = result.operatorName;
  entry["attempt"] = result.attempt;
  entry["started"] = utcText(result.started);
  entry["duration_ms"] = result.duration.count();
  entry["screen"] = {{"width", result.screen.width}, {"height", result.screen.height}};
  entry["values"] = std::move(values);
  return entry;
}

std::string jsonText(const ordered_json& root) {
  return root.dump(kIndent, ' ', false, json::error_handler_t::replace) + "\n";
}

std::string resultsJson(const RunStart& run, RunState state, std::span<const TestResult> results) {
  ordered_json root = {{"version", kVersion}};
  if (!run.unit.empty()) root["unit"] = run.unit;
  if (!run.planHash.empty()) root["plan"] = {{"name", run.planName}, {"hash", run.planHash}};
  if (state == RunState::Finished) root["state"] = stateName(state);
  ordered_json& list = root["results"] = ordered_json::array();
  for (const TestResult& result : results) list.push_back(resultEntry(result));
  return jsonText(root);
}

std::optional<ResultFile> parseResults(std::string_view text, std::string& reason) {
  if (const int line = lineOfNul(text); line > 0) {
    reason = "is not JSON: holds a NUL byte in line " + std::to_string(line);
    return {};
  }
  const json root = json::parse(text, nullptr, false);  // without exceptions
  const json& list = memberOf(root, "results");
  if (!list.is_array()) {
    reason = root.is_discarded() ? "is not JSON" : "has no list of \"results\"";
    return {};
  }
  ResultFile file;
  if (!checkVersion(root, reason) || !readResults(list, file.results, reason)) return {};
  if (const char* const wrong = readMembers<ResultFile>(root, kFileMembers, file)) {
    reason = std::string("has no valid \"") + wrong + "\"";
    return {};
  }
  return file;
}

}  // namespace factory_test
