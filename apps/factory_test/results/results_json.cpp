#include "results/results_json.h"

#include <array>
#include <cstdint>
#include <limits>
#include <nlohmann/json.hpp>
#include <utility>

#include "results/utc_time.h"

namespace factory_test {

namespace {

using nlohmann::json;
using nlohmann::ordered_json;

constexpr int kIndent = 2;

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

bool readTest(const json& value, TestResult& result) {
  if (!value.is_string()) return false;
  result.test = value.get<std::string>();
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

struct Member {
  const char* name;
  bool (*read)(const json& value, TestResult& result);
};
constexpr auto kMembers = std::to_array<Member>({
    {"test", readTest},
    {"verdict", readVerdict},
    {"started", readStarted},
    {"duration_ms", readDuration},
    {"screen", readScreen},
});

// The name of the first member that is missing or wrong. Null: none is.
const char* readResult(const json& entry, TestResult& result) {
  for (const auto& [name, read] : kMembers) {
    if (!read(memberOf(entry, name), result)) return name;
  }
  return nullptr;
}

ordered_json resultEntry(const TestResult& result) {
  return {{"test", result.test},
          {"verdict", verdictName(result.verdict)},
          {"started", utcText(result.started)},
          {"duration_ms", result.duration.count()},
          {"screen", {{"width", result.screen.width}, {"height", result.screen.height}}}};
}

}  // namespace

std::string resultsJson(std::span<const TestResult> results) {
  ordered_json list = ordered_json::array();
  for (const TestResult& result : results) list.push_back(resultEntry(result));
  const ordered_json root = {{"results", std::move(list)}};
  return root.dump(kIndent, ' ', false, json::error_handler_t::replace) + "\n";
}

std::optional<std::vector<TestResult>> parseResults(std::string_view text, std::string& reason) {
  const json root = json::parse(text, nullptr, false);  // without exceptions
  const json& list = memberOf(root, "results");
  if (!list.is_array()) {
    reason = root.is_discarded() ? "is not JSON" : "has no list of \"results\"";
    return {};
  }
  std::vector<TestResult> results(list.size());
  for (std::size_t i = 0; i < results.size(); ++i) {
    if (const char* const wrong = readResult(list[i], results[i])) {
      reason = "result " + std::to_string(i + 1) + " has no valid \"" + wrong + "\"";
      return {};
    }
  }
  return results;
}

}  // namespace factory_test
