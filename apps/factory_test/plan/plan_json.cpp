#include "plan/plan_json.h"

#include <openssl/evp.h>

#include <array>
#include <cmath>
#include <cstdint>
#include <nlohmann/json.hpp>
#include <span>

namespace factory_test {

namespace {

using nlohmann::json;
using nlohmann::ordered_json;

constexpr int kIndent = 2;

// A whole number without ".0", as a person writes it.
ordered_json numberOf(double number) {
  constexpr double kExact = 1e15;  // whole numbers below it are exact
  if (number == std::floor(number) && std::abs(number) < kExact) {
    return static_cast<int64_t>(number);
  }
  return number;
}

ordered_json limitsOf(const PlanStep& step) {
  ordered_json all = ordered_json::object();
  for (const auto& [name, limits] : step.limits) {
    ordered_json one = ordered_json::object();
    if (limits.least) one["least"] = numberOf(*limits.least);
    if (limits.most) one["most"] = numberOf(*limits.most);
    all[name] = std::move(one);
  }
  return all;
}

ordered_json parametersOf(const PlanStep& step) {
  ordered_json all = ordered_json::object();
  for (const auto& [name, value] : step.parameters) all[name] = numberOf(value);
  return all;
}

ordered_json entryOf(const PlanStep& step) {
  ordered_json entry = {{"test", step.test},
                        {"text", step.text},
                        {"limits", limitsOf(step)},
                        {"parameters", parametersOf(step)},
                        {"retries", step.retries},
                        {"timeout_s", step.timeout},
                        {"on_failure", onFailureName(step.onFailure)}};
  if (!step.keys.empty()) entry["keys"] = step.keys;
  return entry;
}

}  // namespace

const char* onFailureName(OnFailure onFailure) {
  switch (onFailure) {
    case OnFailure::Stop: return "stop";
    case OnFailure::Ask: return "ask";
    default: return "go_on";
  }
}

std::string planJson(const Plan& plan) {
  ordered_json steps = ordered_json::array();
  for (const PlanStep& step : plan.steps) steps.push_back(entryOf(step));
  const ordered_json root = {
      {"version", kPlanVersion}, {"name", plan.name}, {"steps", std::move(steps)}};
  return root.dump(kIndent, ' ', false, json::error_handler_t::replace) + "\n";
}

std::string planHash(const Plan& plan) {
  constexpr std::string_view kDigits = "0123456789abcdef";
  constexpr unsigned int kHalf = 16;
  const std::string text = planJson(plan);
  std::array<unsigned char, EVP_MAX_MD_SIZE> digest = {};
  unsigned int length = 0;
  EVP_Digest(text.data(), text.size(), digest.data(), &length, EVP_sha256(), nullptr);
  std::string hash;
  for (const unsigned char byte : std::span(digest).first(length)) {
    hash += kDigits[byte / kHalf];
    hash += kDigits[byte % kHalf];
  }
  return hash;
}

}  // namespace factory_test
