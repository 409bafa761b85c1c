/// How a result stands in JSON files.
#pragma once

#include <nlohmann/json.hpp>
#include <string>

#include "results/test_result.h"

namespace factory_test {

/// The object that results_json.h shows, for a result that is clamped().
nlohmann::ordered_json resultEntry(const TestResult& result);

/// A file's text, with a line end. Bytes that are no UTF-8 become U+FFFD.
std::string jsonText(const nlohmann::ordered_json& root);

}  // namespace factory_test
