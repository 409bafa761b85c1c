#include "results/results_json.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <limits>
#include <nlohmann/json.hpp>
#include <set>
#include <utility>

#include "results/utc_time.h"

namespace factory_test {

namespace {

using nlohmann::json;
using nlohmann::ordered_json;

constexpr unsigned kFormat = 1;
constexpr int kIndent = 2;

// The only types that a member may have; false: it has another, or a value out of its range.

bool readInteger(const json& value, uint64_t most, uint64_t& number) {
  if (!value.is_number_unsigned()) return false;
  number = value.get<uint64_t>();
  return number <= most;
}

bool readSide(const json& screen, const char* name, int& side) {
  const auto value = screen.find(name);
  uint64_t pixels = 0;
  if (value == screen.end() || !readInteger(*value, std::numeric_limits<int>::max(), pixels)) {
    return false;
  }
  side = static_cast<int>(pixels);
  return true;
}

bool readVerdict(const json& value, TestResult& result) {
  for (const auto verdict : {Verdict::None, Verdict::Pass, Verdict::Fail}) {
    if (value != verdictName(verdict)) continue;
    result.verdict = verdict;
    return true;
  }
  return false;
}

bool readTest(const json& value, TestResult& result) {
  if (!value.is_string()) return false;
  result.test = value.get<std::string>();
  return true;
}

bool readStarted(const json& value, TestResult& result) {
  if (!value.is_string()) return false;
  const auto time = parseUtc(value.get_ref<const std::string&>());
  result.started = time.value_or(result.started);
  return time.has_value();
}

bool readDuration(const json& value, TestResult& result) {
  uint64_t count = 0;
  if (!readInteger(value, kLongestDuration.count(), count)) return false;
  result.duration = std::chrono::milliseconds(count);
  return true;
}

bool readScreen(const json& value, TestResult& result) {
  return value.is_object() && readSide(value, "width", result.screen.width) &&
         readSide(value, "height", result.screen.height);
}

struct Member {
  const char* name;
  const char* wanted;
  bool (*read)(const json& value, TestResult& result);
  ordered_json (*write)(const TestResult& result);
};

// In the order of the file.
constexpr auto kMembers = std::to_array<Member>({
    {"test", "a text", readTest,
     [](const TestResult& result) -> ordered_json { return result.test; }},
    {"verdict", "PASS, FAIL or none", readVerdict,
     [](const TestResult& result) -> ordered_json { return verdictName(result.verdict); }},
    {"started", "a time like 2026-11-21T07:00:00Z", readStarted,
     [](const TestResult& result) -> ordered_json { return utcText(result.started); }},
    {"duration_ms", "a whole number of milliseconds, at most a year", readDuration,
     [](const TestResult& result) -> ordered_json { return result.duration.count(); }},
    {"screen", "a width and a height in pixels", readScreen,
     [](const TestResult& result) -> ordered_json {
       return {{"width", result.screen.width}, {"height", result.screen.height}};
     }},
});

std::string quoted(std::string_view name) { return std::string("\"").append(name).append("\""); }

// The name of the first member that is missing or wrong, with what it should be; empty: none is.
std::string readMembers(const json& entry, TestResult& result) {
  if (!entry.is_object()) return "is no object";
  for (const Member& member : kMembers) {
    const auto value = entry.find(member.name);
    if (value == entry.end()) return quoted(member.name) + " is missing";
    if (!member.read(*value, result)) return quoted(member.name) + " is not " + member.wanted;
  }
  return {};
}

std::optional<json> parseJson(std::string_view text, std::string& reason) {
  try {
    return json::parse(text);
  } catch (const json::parse_error& error) {
    const auto readBytes = std::min(error.byte, text.size());
    const auto line = 1 + std::ranges::count(text.substr(0, readBytes), '\n');
    reason = "is not JSON (line " + std::to_string(line) + ")";
  } catch (const json::exception&) {
    reason = "is not JSON";  // a number that no type holds
  }
  return {};
}

std::string wrongFormat(const json& root) {
  if (!root.is_object()) return "is no results file";
  const auto format = root.find("format");
  if (format == root.end()) return "is no results file: \"format\" is missing";
  if (!format->is_number_unsigned() || *format != kFormat) {
    return "has another \"format\" than " + std::to_string(kFormat);
  }
  const auto results = root.find("results");
  if (results == root.end() || !results->is_array()) return "has no list of \"results\"";
  return {};
}

}  // namespace

std::string resultsJson(std::span<const TestResult> results) {
  ordered_json list = ordered_json::array();
  for (const TestResult& result : results) {
    ordered_json entry;
    for (const Member& member : kMembers) entry[member.name] = member.write(result);
    list.push_back(std::move(entry));
  }
  const ordered_json root = {{"format", kFormat}, {"results", std::move(list)}};
  return root.dump(kIndent) + "\n";
}

std::optional<std::vector<TestResult>> parseResults(std::string_view text, std::string& reason) {
  const auto root = parseJson(text, reason);
  if (!root) return {};
  reason = wrongFormat(*root);
  if (!reason.empty()) return {};
  std::vector<TestResult> results;
  std::set<std::string> tests;
  for (const json& entry : *root->find("results")) {
    TestResult result;
    std::string fault = readMembers(entry, result);
    if (fault.empty() && !tests.insert(result.test).second) fault = "its test stands twice";
    if (!fault.empty()) {
      reason = "result " + std::to_string(results.size() + 1) + ": " + fault;
      return {};
    }
    results.push_back(std::move(result));
  }
  return results;
}

}  // namespace factory_test
