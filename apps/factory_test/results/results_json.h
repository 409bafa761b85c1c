/// The results file's text.
///
///     {
///       "format": 1,
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
/// "FAIL" or "none", "started" UTC; a test stands once. A later format has another number.
#pragma once

#include <cstddef>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "results/test_result.h"

namespace factory_test {

constexpr std::size_t kLongestJson = std::size_t{1} << 20;  // bytes of a results file

/// The file's text for results that are storable() and of different tests.
std::string resultsJson(std::span<const TestResult> results);

/// The results in `text`, all of them storable(). Nothing for any other text; `reason` then says
/// what is wrong, in one line and in words of this program only.
std::optional<std::vector<TestResult>> parseResults(std::string_view text, std::string& reason);

}  // namespace factory_test
