/// Failures that are rehearsed.
#pragma once

#include <optional>
#include <set>
#include <string>
#include <string_view>

#include "plan/plan.h"
#include "results/test_result.h"

namespace factory_test {

/// Tests that fail whatever the operator and the values say: at every attempt, or at the first one.
class Simulation {
 public:
  /// "fail:ID,retry:ID"; an empty text rehearses nothing. Nothing is returned, and `error` says why
  /// in one line, for another text, and for a test that the plan does not have or that was named
  /// before.
  static std::optional<Simulation> parse(std::string_view text, const Plan& plan,
                                         std::string& error);

  /// What becomes of a verdict; one that was not given (None) stays.
  Verdict rehearsed(Verdict given, const std::string& test, int attempt) const;
  bool isEmpty() const { return failing.empty() && retried.empty(); }

 private:
  bool add(std::string_view item, const Plan& plan, std::string& error);

  std::set<std::string> failing;
  std::set<std::string> retried;
};

}  // namespace factory_test
