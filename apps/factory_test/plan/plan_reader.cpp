#include "plan/plan_reader.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <span>
#include <utility>

#include "plan/plan_json.h"
#include "results/whole_file.h"
#include "utf8.h"

namespace factory_test {

namespace {

using Kind = JsonNode::Kind;

constexpr double kFarthest = 1e9;  // of limits, to both sides
constexpr int kMostRetries = 10;
constexpr int kLongestTimeout = 3600;  // seconds
constexpr std::size_t kLongestName = 64;
constexpr std::size_t kLongestText = 120;  // what a page has room for

// What the readers of fields share.
struct Reading {
  const std::vector<KnownTest>& known;
  Complaint& complaint;

  bool refuse(const JsonNode& node, std::string what) const {
    complaint = {node.line, std::move(what)};
    return false;
  }
};

std::string inQuotes(std::string_view words) {
  std::string text = "'";
  text.append(shortened(words)).append("'");
  return text;
}

std::string plain(double number) {
  std::string text = std::to_string(number);
  text.erase(text.find_last_not_of('0') + 1);
  if (text.back() == '.') text.pop_back();
  return text;
}

bool readNumber(const JsonNode& node, Limits range, double& number, const Reading& reading) {
  if (node.kind != Kind::Number || node.number < *range.least || node.number > *range.most) {
    return reading.refuse(node, inQuotes(node.name) + " is no number from " + plain(*range.least) +
                                    " to " + plain(*range.most));
  }
  number = node.number;
  return true;
}

bool readWhole(const JsonNode& node, Limits range, double& number, const Reading& reading) {
  if (node.kind != Kind::Number || node.number < *range.least || node.number > *range.most ||
      node.number != std::floor(node.number)) {
    return reading.refuse(node, inQuotes(node.name) + " is no whole number from " +
                                    plain(*range.least) + " to " + plain(*range.most));
  }
  number = node.number;
  return true;
}

bool readCount(const JsonNode& node, int most, int& count, const Reading& reading) {
  double number = 0;
  if (!readWhole(node, {0, most}, number, reading)) return false;
  count = static_cast<int>(number);
  return true;
}

std::size_t letters(std::string_view text) {
  return text.size() - static_cast<std::size_t>(std::ranges::count_if(text, isInsideCharacter));
}

struct TextRange {
  std::size_t least;
  std::size_t most;
  bool mayHaveLines;
};

bool readText(const JsonNode& node, TextRange range, std::string& text, const Reading& reading) {
  const bool isClean = std::ranges::none_of(node.text, [range](char each) {
    return isControl(each) && !(range.mayHaveLines && each == '\n');
  });
  if (node.kind == Kind::Text && !isClean) {
    return reading.refuse(node, inQuotes(node.name) + " has a control character");
  }
  const std::size_t length = letters(node.text);
  if (node.kind != Kind::Text || length < range.least || length > range.most) {
    return reading.refuse(node, inQuotes(node.name) + " is no text of " +
                                    std::to_string(range.least) + " to " +
                                    std::to_string(range.most) + " letters");
  }
  text = node.text;
  return true;
}

template <typename Target>
struct Field {
  std::string_view name;
  bool isRequired;
  bool (*read)(const JsonNode& node, Target& target, const Reading& reading);
};

// Reads the members of an object, each by its field; what they are called together is `what`.
template <typename Target>
bool readFields(const JsonNode& node, std::span<const Field<Target>> fields, Target& target,
                const Reading& reading, const std::string& what) {
  if (node.kind != Kind::Object) return reading.refuse(node, what + " is no object");
  for (auto member = node.items.begin(); member != node.items.end(); ++member) {
    const auto field = std::ranges::find(fields, member->name, &Field<Target>::name);
    if (field == fields.end()) {
      return reading.refuse(*member, what + " has the unknown field " + inQuotes(member->name));
    }
    if (std::find_if(node.items.begin(), member, [&](const JsonNode& earlier) {
          return earlier.name == member->name;
        }) != member) {
      return reading.refuse(*member, what + " has " + inQuotes(member->name) + " twice");
    }
    if (!field->read(*member, target, reading)) return false;
  }
  for (const Field<Target>& field : fields) {
    if (field.isRequired &&
        std::ranges::find(node.items, field.name, &JsonNode::name) == node.items.end()) {
      return reading.refuse(node, what + " has no " + inQuotes(field.name));
    }
  }
  return true;
}

bool readTest(const JsonNode& node, PlanStep& step, const Reading& reading) {
  step.test = node.text;
  if (node.kind == Kind::Text &&
      std::ranges::find(reading.known, node.text, &KnownTest::id) != reading.known.end()) {
    return true;
  }
  std::string what = "unknown test " + inQuotes(node.text) + ", known are:";
  for (const KnownTest& test : reading.known) what.append(" ").append(test.id);
  return reading.refuse(node, what);
}

std::string listOf(std::span<const std::string_view> names) {
  std::string words = names.empty() ? " none" : "";
  for (const std::string_view name : names) words.append(words.empty() ? " " : ", ").append(name);
  return words;
}

bool readLeast(const JsonNode& node, Limits& limits, const Reading& reading) {
  return readNumber(node, {-kFarthest, kFarthest}, limits.least.emplace(), reading);
}

bool readMost(const JsonNode& node, Limits& limits, const Reading& reading) {
  return readNumber(node, {-kFarthest, kFarthest}, limits.most.emplace(), reading);
}

constexpr auto kLimitFields = std::to_array<Field<Limits>>({
    {"least", false, readLeast},
    {"most", false, readMost},
});

bool readLimit(const JsonNode& node, PlanStep& step, const Reading& reading) {
  const std::string what = "the limit of " + inQuotes(node.name);
  Limits limits;
  if (!readFields<Limits>(node, kLimitFields, limits, reading, what)) return false;
  if (!limits.least && !limits.most) return reading.refuse(node, what + " is empty");
  if (limits.least && limits.most && *limits.least > *limits.most) {
    return reading.refuse(node, what + " has a least above its most");
  }
  if (!step.limits.emplace(node.name, limits).second) {
    return reading.refuse(node, what + " is there twice");
  }
  return true;
}

bool readLimits(const JsonNode& node, PlanStep& step, const Reading& reading) {
  if (node.kind != Kind::Object) return reading.refuse(node, "'limits' is no object");
  return std::ranges::all_of(
      node.items, [&](const JsonNode& limit) { return readLimit(limit, step, reading); });
}

bool readParameters(const JsonNode& node, PlanStep& step, const Reading& reading) {
  if (node.kind != Kind::Object) return reading.refuse(node, "'parameters' is no object");
  for (const JsonNode& parameter : node.items) {
    const auto [place, isNew] = step.parameters.emplace(parameter.name, 0);
    if (!isNew) return reading.refuse(parameter, inQuotes(parameter.name) + " is there twice");
    if (!readNumber(parameter, {-kFarthest, kFarthest}, place->second, reading)) return false;
  }
  return true;
}

bool readKeys(const JsonNode& node, PlanStep& step, const Reading& reading) {
  if (node.kind != Kind::List || node.items.empty()) {
    return reading.refuse(node, "'keys' is no list with a key in it");
  }
  for (const JsonNode& key : node.items) {
    if (key.kind != Kind::Text || std::ranges::count(keyNames(), key.text) == 0) {
      return reading.refuse(key, "'keys' has one that is none of:" + listOf(keyNames()));
    }
    if (std::ranges::count(step.keys, key.text) > 0) {
      return reading.refuse(key, "the key " + inQuotes(key.text) + " is there twice");
    }
    step.keys.push_back(key.text);
  }
  return true;
}

bool readRetries(const JsonNode& node, PlanStep& step, const Reading& reading) {
  return readCount(node, kMostRetries, step.retries, reading);
}

bool readTimeout(const JsonNode& node, PlanStep& step, const Reading& reading) {
  return readCount(node, kLongestTimeout, step.timeout, reading);
}

bool readStepText(const JsonNode& node, PlanStep& step, const Reading& reading) {
  return readText(node, {0, kLongestText, true}, step.text, reading);
}

bool readOnFailure(const JsonNode& node, PlanStep& step, const Reading& reading) {
  std::string words;
  for (const OnFailure each : {OnFailure::GoOn, OnFailure::Stop, OnFailure::Ask}) {
    words.append(words.empty() ? "" : ", ").append(onFailureName(each));
    step.onFailure = each;
    if (node.kind == Kind::Text && node.text == onFailureName(each)) return true;
  }
  return reading.refuse(node, "'on_failure' is none of " + words);
}

constexpr auto kStepFields = std::to_array<Field<PlanStep>>({
    {"test", true, readTest},
    {"text", false, readStepText},
    {"limits", false, readLimits},
    {"parameters", false, readParameters},
    {"keys", false, readKeys},
    {"retries", false, readRetries},
    {"timeout_s", false, readTimeout},
    {"on_failure", false, readOnFailure},
});

const JsonNode* memberOf(const JsonNode& node, std::string_view name) {
  const auto found = std::ranges::find(node.items, name, &JsonNode::name);
  return found == node.items.end() ? nullptr : &*found;
}

std::string namesOf(const auto& kinds) {
  std::vector<std::string_view> names;
  for (const auto& kind : kinds) names.push_back(kind.name);
  return listOf(names);
}

// Whether the test has all values and parameters that the step names; these may stand before the
// test's own name.
bool checkNames(const JsonNode& node, const PlanStep& step, const Reading& reading) {
  const TestKind& kind = testKind(step.test);
  if (const JsonNode* const limits = memberOf(node, "limits")) {
    for (const JsonNode& limit : limits->items) {
      if (std::ranges::find(kind.values, limit.name, &ValueKind::name) != kind.values.end())
        continue;
      return reading.refuse(limit, inQuotes(step.test) + " has no value " + inQuotes(limit.name) +
                                       ", it has:" + namesOf(kind.values));
    }
  }
  const JsonNode* const keys = memberOf(node, "keys");
  if (keys != nullptr && !kind.asksForKeys) {
    return reading.refuse(*keys, inQuotes(step.test) + " asks for no keys");
  }
  const JsonNode* const parameters = memberOf(node, "parameters");
  if (parameters == nullptr) return true;
  for (const JsonNode& parameter : parameters->items) {
    const auto found = std::ranges::find(kind.parameters, parameter.name, &ParameterKind::name);
    if (found == kind.parameters.end()) {
      return reading.refuse(parameter, inQuotes(step.test) + " has no parameter " +
                                           inQuotes(parameter.name) +
                                           ", it has:" + namesOf(kind.parameters));
    }
    double number = 0;
    const auto read = found->isWhole ? readWhole : readNumber;
    if (!read(parameter, {found->least, found->most}, number, reading)) return false;
  }
  return true;
}

bool readSteps(const JsonNode& node, Plan& plan, const Reading& reading) {
  if (node.kind != Kind::List || node.items.empty()) {
    return reading.refuse(node, "'steps' is no list with a step in it");
  }
  for (const JsonNode& item : node.items) {
    PlanStep step;
    if (!readFields<PlanStep>(item, kStepFields, step, reading, "a step") ||
        !checkNames(item, step, reading)) {
      return false;
    }
    if (plan.find(step.test) != nullptr) {
      return reading.refuse(item, "the test " + inQuotes(step.test) + " is there twice");
    }
    const PlanStep usual = usualStep(step.test, step.parameters);
    if (memberOf(item, "limits") == nullptr) step.limits = usual.limits;
    if (step.keys.empty()) step.keys = usual.keys;
    step.parameters = usual.parameters;
    if (memberOf(item, "timeout_s") == nullptr) step.timeout = usual.timeout;
    plan.steps.push_back(std::move(step));
  }
  return true;
}

bool readVersion(const JsonNode& node, Plan&, const Reading& reading) {
  if (node.kind == Kind::Number && node.number == kPlanVersion) return true;
  return reading.refuse(node, "'version' is not " + std::to_string(kPlanVersion));
}

bool readName(const JsonNode& node, Plan& plan, const Reading& reading) {
  return readText(node, {1, kLongestName, false}, plan.name, reading);
}

// For editors that check a file while it is written.
bool readSchema(const JsonNode& node, Plan&, const Reading& reading) {
  return node.kind == Kind::Text || reading.refuse(node, "'$schema' is no text");
}

constexpr auto kPlanFields = std::to_array<Field<Plan>>({
    {"$schema", false, readSchema},
    {"version", true, readVersion},
    {"name", true, readName},
    {"steps", true, readSteps},
});

}  // namespace

std::optional<Plan> parsePlan(std::string_view text, const std::vector<KnownTest>& known,
                              Complaint& complaint) {
  const auto root = parseJson(text, complaint);
  if (!root) return {};
  Plan plan;
  if (!readFields<Plan>(*root, kPlanFields, plan, {known, complaint}, "the plan")) return {};
  return plan;
}

std::optional<Plan> readPlan(const std::filesystem::path& file, const std::vector<KnownTest>& known,
                             std::string& error) {
  const auto text = readFile(file, error);
  if (!text) return {};
  Complaint complaint;
  auto plan = parsePlan(*text, known, complaint);
  if (!plan) error = file.native() + ":" + std::to_string(complaint.line) + ": " + complaint.what;
  return plan;
}

}  // namespace factory_test
