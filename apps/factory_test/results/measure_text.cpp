#include "results/measure_text.h"

#include <array>
#include <charconv>

namespace factory_test {

std::string numberText(double number) {
  constexpr std::size_t kMostDigits = 32;
  std::array<char, kMostDigits> text = {};
  const auto [end, failure] = std::to_chars(text.data(), text.data() + text.size(), number);
  return {text.data(), end};
}

std::string limitsText(const Measure& measure) {
  if (measure.least && measure.most) {
    return numberText(*measure.least) + " to " + numberText(*measure.most);
  }
  if (measure.least) return "at least " + numberText(*measure.least);
  return measure.most ? "at most " + numberText(*measure.most) : "";
}

std::string measureText(const Measure& measure) {
  std::string text = numberText(measure.value);
  if (!measure.unit.empty()) text += " " + measure.unit;
  const std::string limits = limitsText(measure);
  return limits.empty() ? text : text + " (" + limits + ")";
}

}  // namespace factory_test
