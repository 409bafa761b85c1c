#include "plan/catalog.h"

#include <algorithm>
#include <array>
#include <cassert>
#include <cmath>

#include "language/language.h"

namespace factory_test {

namespace {

constexpr Limits none() { return {}; }
constexpr Limits least(double value) { return {.least = value, .most = {}}; }
constexpr Limits most(double value) { return {.least = {}, .most = value}; }

// The pages say what each value is; docs/plans.md says it to those who write plans.
constexpr auto kColours = std::to_array<ValueKind>({{msg("colours confirmed"), "", none()}});
constexpr auto kDeadPixels = std::to_array<ValueKind>({{msg("patterns confirmed"), "", none()}});
constexpr auto kBacklight = std::to_array<ValueKind>({{msg("steps confirmed"), "", none()}});
constexpr auto kGrid = std::to_array<ValueKind>({
    {msg("cells"), "", least(1)},
    {msg("cells missed"), "", most(0)},
});
constexpr auto kGridParameters = std::to_array<ParameterKind>({{"cell mm", 3, 30, 8}});
constexpr auto kLines = std::to_array<ValueKind>({
    {msg("lines followed"), "", least(2)},
    {msg("worst distance"), msg("mm"), most(5)},
    {msg("longest gap"), "mm", most(10)},
});
constexpr auto kTrails = std::to_array<ValueKind>({
    {msg("fingers counted"), "", none(), "fingers"},
    {msg("longest trail"), "mm", none()},
});
constexpr auto kFingers = std::to_array<ParameterKind>({{"fingers", 2, 10, 2, true}});
constexpr auto kRate = std::to_array<ValueKind>({
    {msg("event rate"), msg("1/s"), least(20)},
    {msg("longest gap"), msg("ms"), none()},
    {msg("latency"), "ms", most(100)},
});
constexpr auto kRateParameters = std::to_array<ParameterKind>({{"seconds", 1, 30, 3}});
constexpr auto kPinch = std::to_array<ValueKind>({
    {msg("fingers counted"), "", none(), "fingers"},
    {msg("narrowest"), "mm", none()},
    {msg("widest"), "mm", none()},
});
constexpr auto kStuck = std::to_array<ValueKind>({
    {msg("touches seen"), "", most(0)},
    {msg("time watched"), msg("s"), none()},
});
constexpr auto kStuckParameters = std::to_array<ParameterKind>({{"seconds", 1, 600, 60, true}});
constexpr auto kKeys = std::to_array<ValueKind>({
    {msg("keys seen"), "", none()},
    {msg("bounces"), "", most(0)},
    {msg("longest bounce"), "ms", none()},
});

constexpr auto kTests = std::to_array<TestKind>({
    {"colours", 0, kColours},
    {"dead_pixels", 0, kDeadPixels},
    {"backlight", 0, kBacklight},
    {"touch_grid", 120, kGrid, kGridParameters},
    {"touch_lines", 60, kLines},
    {"touch_trails", 60, kTrails, kFingers},
    {"touch_rate", 60, kRate, kRateParameters},
    {"pinch", 60, kPinch, kFingers},
    {"stuck_touch", 0, kStuck, kStuckParameters},
    {"keys", 120, kKeys, {}, true},
});
constexpr TestKind kMeasuresNothing = {""};

constexpr auto kKeyNames = std::to_array<std::string_view>(
    {"up", "down", "left", "right", "select", "hook", "volume up", "volume down", "power", "home"});

}  // namespace

std::span<const std::string_view> keyNames() { return kKeyNames; }

const TestKind& testKind(std::string_view test) {
  const auto* const found = std::ranges::find(kTests, test, &TestKind::test);
  return found == kTests.end() ? kMeasuresNothing : *found;
}

Measure measured(std::string_view test, std::string_view name, double value) {
  constexpr double kParts = 100;
  const auto kinds = testKind(test).values;
  const auto kind = std::ranges::find(kinds, name, &ValueKind::name);
  assert(kind != kinds.end());
  return {.name = std::string(name),
          .unit = std::string(kind->unit),
          .value = std::round(value * kParts) / kParts};
}

std::vector<Measure> measured(std::string_view test, std::initializer_list<Figure> figures) {
  std::vector<Measure> values;
  for (const auto& [name, figure] : figures) {
    if (std::isfinite(figure)) values.push_back(measured(test, name, figure));
  }
  return values;
}

}  // namespace factory_test
