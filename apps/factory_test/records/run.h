/// Runs of a plan, as the records keep them.
#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "results/test_result.h"

namespace factory_test {

/// A run is Running while its program lives, Finished once all tests of its plan have a verdict or
/// the plan ended it, Aborted when the program ended before that.
enum class RunState { Running, Finished, Aborted };

/// Whether a start goes on with what is kept of a unit: also where a plan is through, only where it
/// is not, or never. A database keeps one run after the other, and goes on with aborted ones alone.
enum class Resume { Yes, Unfinished, No };

/// "running", "finished", "aborted".
const char* stateName(RunState state);

/// Who tests what by which plan.
struct RunStart {
  std::string unit = {};          // serial number; empty: unknown
  std::string operatorName = {};  // empty: unknown
  std::string planName = {};
  std::string planHash = {};
  std::vector<std::string> tests = {};  // of the plan, in order
  std::string software = {};            // version of this program
  std::string station = {};             // the host's name
  std::chrono::sys_seconds started = {};
};

/// What the name of a plan ends with whose failures were rehearsed, so that nobody takes its
/// results for others.
inline constexpr std::string_view kRehearsal = " (rehearsal)";

struct VerdictRecord {
  std::string id = {};  // UUID
  TestResult result = {};

  bool operator==(const VerdictRecord&) const = default;
};

struct RunRecord {
  std::string id = {};  // UUID
  RunStart start = {};
  std::optional<std::chrono::sys_seconds> ended = {};  // its last verdict; nothing while it runs
  RunState state = RunState::Running;
  std::vector<VerdictRecord> verdicts = {};  // all of them, in the order in which they were given
};

/// `text` in UTF-8 without control characters, which become U+FFFD, cut to 400 bytes at most:
/// what every database and every export can hold.
std::string storable(const std::string& text);
/// The same for all of its texts.
RunStart storable(RunStart start);

/// Whether `text` may be a unit's serial number: 1 to 64 letters, digits and punctuation marks of
/// ASCII, without spaces. `error` says in one line why not.
bool isSerial(const std::string& text, std::string& error);

}  // namespace factory_test
