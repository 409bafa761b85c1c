/// What a factory test performs: which tests, in which order, and how each is judged.
#pragma once

#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "plan/catalog.h"

namespace factory_test {

/// What a run does once a test has failed for good.
enum class OnFailure { GoOn, Stop, Ask };

struct PlanStep {
  std::string test = {};                          // its id
  std::string text = {};                          // for the operator; empty: the page's own
  std::map<std::string, Limits> limits = {};      // by the value's name
  std::map<std::string, double> parameters = {};  // by name; one that is missing has its usual
  std::vector<std::string> keys = {};             // that a test of keys asks for, by keyNames()
  int retries = 0;                                // how often a failed test is begun anew
  int timeout = 0;                                // seconds until it fails by itself; 0: never
  OnFailure onFailure = OnFailure::GoOn;

  /// What the step says of one of the test's parameters in the catalogue, or its usual figure.
  double parameter(std::string_view name) const;
  bool operator==(const PlanStep&) const = default;
};

struct Plan {
  std::string name = {};
  std::vector<PlanStep> steps = {};  // of different tests

  /// Null: the test is not in the plan.
  const PlanStep* find(std::string_view test) const;
  bool operator==(const Plan&) const = default;
};

/// A test of the program, as plans know it.
struct KnownTest {
  std::string id;
  bool isUsual;  // it is in the default plan
};

/// The limits, retries and time-out that a test has without a plan; with some of its parameters, by
/// name, where these are not the usual ones.
PlanStep usualStep(std::string_view test, const std::map<std::string, double>& parameters = {});

/// The built-in menu's.
Plan defaultPlan(const std::vector<KnownTest>& known);

}  // namespace factory_test
