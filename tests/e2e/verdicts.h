/// What a results file says.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "e2e/app_screens.h"
#include "results/results_json.h"
#include "results/whole_file.h"

namespace factory_test {

/// The verdicts that the file holds, a line each, in the order in which they were given.
inline std::string verdictsIn(const std::string& file) {
  std::string error;
  const auto text = readFile(file, error);  // the book would want the file for itself
  const auto kept = parseResults(text.value_or(""), error);
  if (!kept) return error;
  std::string words;
  for (const TestResult& each : kept->results) {
    EXPECT_EQ(each.screen.width, screens::kScreen.width);
    EXPECT_EQ(each.screen.height, screens::kScreen.height);
    words += each.test + " " + verdictName(each.verdict) + "\n";
  }
  return words;
}

}  // namespace factory_test
