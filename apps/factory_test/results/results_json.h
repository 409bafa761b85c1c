/// The results file's text. schema/results.schema.json says the same for a machine.
///
///     {
///       "version": 2,
///       "unit": "A1234",
///       "plan": {"name": "Touch station", "hash": "9f86d081884c7d65..."},
///       "state": "finished",
///       "results": [
///         {
///           "test": "display colours",
///           "verdict": "PASS",
///           "attempt": 1,
///           "started": "2026-11-21T07:00:00Z",
///           "duration_ms": 4200,
///           "screen": {"width": 1440, "height": 2560},
///           "values": [
///             {"name": "colour steps", "unit": "", "value": 8, "least": 8}
///           ]
///         }
///       ]
///     }
///
/// Members may come in any order; unknown ones are passed over. "verdict" is "PASS", "FAIL" or
/// "none", "started" UTC, a figure 0 to INT_MAX, "attempt" 1 or more. Of a FAIL, or of
/// "none", "reason" may say why, of any verdict "operator" who gave it. "unit" is the serial number
/// of what was tested, left out where nobody said one; "plan" is the one by which it was tested, by
/// its name and its hash; "state" is "finished" once the plan is through, and left out before;
/// "least" and "most" are left out where there is no limit. Version 1, which says no version, has
/// neither units, plans, attempts nor values.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "records/run.h"
#include "results/test_result.h"

namespace factory_test {

/// What a file holds.
struct ResultFile {
  RunStart run = {};  // unit and plan, as far as it names them
  RunState state = RunState::Running;
  std::vector<TestResult> results = {};
};

/// The file's text for results that are clamped(). Bytes of a name that are no UTF-8 become U+FFFD.
std::string resultsJson(const RunStart& run, RunState state, std::span<const TestResult> results);

/// What `text` holds. Nothing for any other text; `reason` then says what is wrong.
std::optional<ResultFile> parseResults(std::string_view text, std::string& reason);

}  // namespace factory_test
