/// What tests measure, and what about them can be set.
#pragma once

#include <initializer_list>
#include <limits>
#include <optional>
#include <span>
#include <string_view>
#include <utility>
#include <vector>

#include "results/test_result.h"

namespace factory_test {

struct Limits {
  std::optional<double> least = {};
  std::optional<double> most = {};

  bool operator==(const Limits&) const = default;
};

struct ValueKind {
  std::string_view name;
  std::string_view unit;          // empty: a count
  Limits usual = {};              // in the default plan
  std::string_view leastOf = {};  // the parameter that is the usual least; empty: none
};

struct ParameterKind {
  std::string_view name;
  double least;
  double most;
  double usual;
  bool isWhole = false;  // nothing between whole numbers
};

/// Tests that are not in the catalogue measure nothing and have no parameters.
struct TestKind {
  std::string_view test;
  int timeout = 0;  // seconds, in the default plan; 0: none
  std::span<const ValueKind> values = {};
  std::span<const ParameterKind> parameters = {};
  bool asksForKeys = false;
};

/// The keys that a test can ask for: "up", "volume down", "power" and so on.
std::span<const std::string_view> keyNames();

const TestKind& testKind(std::string_view test);

/// A value of the catalogue as the test delivers it, to a hundredth.
Measure measured(std::string_view test, std::string_view name, double value);

/// The figure of what was not measured.
inline constexpr double kNotMeasured = std::numeric_limits<double>::quiet_NaN();

using Figure = std::pair<std::string_view, double>;  // by the value's name

/// The same for several values. What is not measured, or not finite, is left out.
std::vector<Measure> measured(std::string_view test, std::initializer_list<Figure> figures);

}  // namespace factory_test
