#include "plan/simulation.h"

namespace factory_test {

std::optional<Simulation> Simulation::parse(std::string_view text, const Plan& plan,
                                            std::string& error) {
  Simulation simulation;
  while (!text.empty()) {
    const std::size_t comma = text.find(',');
    if (!simulation.add(text.substr(0, comma), plan, error)) return {};
    if (comma + 1 == text.size()) {
      error = "--simulate ends with a comma";
      return {};
    }
    text = comma == std::string_view::npos ? "" : text.substr(comma + 1);
  }
  return simulation;
}

bool Simulation::add(std::string_view item, const Plan& plan, std::string& error) {
  const std::size_t colon = item.find(':');
  const std::string_view word = item.substr(0, colon);
  if (colon == std::string_view::npos || (word != "fail" && word != "retry")) {
    error = "--simulate: '" + std::string(item) + "' is neither fail:ID nor retry:ID";
    return false;
  }
  const std::string test(item.substr(colon + 1));
  if (plan.find(test) == nullptr) {
    error = "--simulate: the plan has no test '" + test + "'";
    return false;
  }
  if (failing.contains(test) || retried.contains(test)) {
    error = "--simulate: the test '" + test + "' is there twice";
    return false;
  }
  (word == "fail" ? failing : retried).insert(test);
  return true;
}

Verdict Simulation::rehearsed(Verdict given, const std::string& test, int attempt) const {
  if (given == Verdict::None) return given;
  if (failing.contains(test)) return Verdict::Fail;
  return retried.contains(test) && attempt == 1 ? Verdict::Fail : given;
}

}  // namespace factory_test
