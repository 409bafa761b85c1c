/// The results file's text.
///
///     {
///       "results": [
///         {
///           "test": "display colours",
///           "verdict": "PASS",
///           "started": "2026-11-21T07:00:00Z",
///           "duration_ms": 4200,
///           "screen": {"width": 1440, "height": 2560}
///         }
///       ]
///     }
///
/// All of these members must be there, in any order; others are passed over. "verdict" is "PASS",
/// "FAIL" or "none", "started" UTC, a figure 0 to INT_MAX.
#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "results/test_result.h"

namespace factory_test {

/// The file's text for results that are clamped(). Bytes of a name that are no UTF-8 become U+FFFD.
std::string resultsJson(std::span<const TestResult> results);

/// The results in `text`. Nothing for any other text; `reason` then says what is wrong.
std::optional<std::vector<TestResult>> parseResults(std::string_view text, std::string& reason);

}  // namespace factory_test
