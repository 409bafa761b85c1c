#include "results/junit.h"

#include <algorithm>
#include <iomanip>
#include <set>
#include <sstream>
#include <utility>
#include <vector>

#include "results/measure_text.h"
#include "results/utc_time.h"
#include "xml/xml_text.h"

namespace factory_test {

namespace {

using brimol::xml::escaped;

constexpr int kSecondDecimals = 3;

using Property = std::pair<std::string, std::string>;

// Those that have a value, if there are any.
void addProperties(std::ostream& xml, const std::string& indent, std::vector<Property> properties) {
  std::erase_if(properties, [](const Property& each) { return each.second.empty(); });
  if (properties.empty()) return;
  xml << indent << "<properties>\n";
  for (const auto& [name, value] : properties) {
    xml << indent << R"(  <property name=")" << escaped(name) << R"(" value=")" << escaped(value)
        << "\"/>\n";
  }
  xml << indent << "</properties>\n";
}

std::vector<Property> propertiesOf(const RunStart& run) {
  return {{"plan", run.planName},   {"plan_hash", run.planHash},    {"unit", run.unit},
          {"station", run.station}, {"operator", run.operatorName}, {"software", run.software}};
}

std::vector<Property> propertiesOf(const TestResult& result) {
  const auto [width, height] = result.screen;
  std::vector<Property> all = {{"started", utcText(result.started)},
                               {"screen", std::to_string(width) + "x" + std::to_string(height)},
                               {"attempt", std::to_string(result.attempt)},
                               {"operator", result.operatorName}};
  for (const Measure& each : result.values) all.emplace_back(each.name, measureText(each));
  return all;
}

// What a failure says first: why, and the values that are at fault.
std::string failureText(const TestResult& result) {
  std::string text = reasonName(result.reason);
  for (const Measure& each : result.values) {
    if (each.isWithin()) continue;
    text += (text.empty() ? "" : "; ") + each.name + " " + measureText(each);
  }
  return text.empty() ? "FAIL" : text;
}

void addVerdict(std::ostream& xml, const TestResult& result) {
  if (result.verdict == Verdict::None) xml << "      <skipped message=\"no verdict\"/>\n";
  if (result.verdict != Verdict::Fail) return;
  xml << R"(      <failure message=")" << escaped(failureText(result)) << "\"/>\n";
}

// A null `result`: not run.
void addCase(std::ostream& xml, const std::string& test, const TestResult* result) {
  const std::chrono::duration<double> seconds =
      result == nullptr ? std::chrono::milliseconds(0) : result->duration;
  xml << R"(    <testcase classname="factory_test" name=")" << escaped(test) << R"(" time=")"
      << seconds.count() << "\">\n";
  if (result == nullptr) {
    xml << "      <skipped message=\"not run\"/>\n";
  } else {
    addProperties(xml, "      ", propertiesOf(*result));
    addVerdict(xml, *result);
  }
  xml << "    </testcase>\n";
}

// The planned tests, then what was done besides.
std::vector<std::string> allTests(const JunitSuite& suite) {
  std::vector<std::string> tests = suite.run.tests;
  std::set<std::string> known(tests.begin(), tests.end());
  for (const TestResult& each : suite.results) {
    if (known.insert(each.test).second) tests.push_back(each.test);
  }
  return tests;
}

// The newest result of a test; null: it has none.
const TestResult* newest(const JunitSuite& suite, const std::string& test) {
  const auto found = std::find_if(suite.results.rbegin(), suite.results.rend(),
                                  [&test](const TestResult& each) { return each.test == test; });
  return found == suite.results.rend() ? nullptr : &*found;
}

void addSuite(std::ostream& xml, const JunitSuite& suite) {
  const std::vector<std::string> tests = allTests(suite);
  std::size_t failures = 0;
  std::size_t skipped = 0;
  std::chrono::duration<double> seconds = {};
  std::ostringstream cases;
  cases << std::fixed << std::setprecision(kSecondDecimals);
  for (const std::string& test : tests) {
    const TestResult* const result = newest(suite, test);
    addCase(cases, test, result);
    failures += result != nullptr && result->verdict == Verdict::Fail ? 1U : 0U;
    skipped += result == nullptr || result->verdict == Verdict::None ? 1U : 0U;
    if (result != nullptr) seconds += result->duration;
  }
  xml << R"(  <testsuite name=")" << escaped(suite.name) << R"(" tests=")" << tests.size()
      << R"(" failures=")" << failures << R"(" errors="0" skipped=")" << skipped << R"(" time=")"
      << seconds.count() << "\">\n";
  addProperties(xml, "    ", propertiesOf(suite.run));
  xml << cases.str() << "  </testsuite>\n";
}

}  // namespace

std::string junitXml(std::span<const JunitSuite> suites) {
  std::ostringstream xml;
  xml << std::fixed << std::setprecision(kSecondDecimals)
      << "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<testsuites>\n";
  for (const JunitSuite& suite : suites) addSuite(xml, suite);
  xml << "</testsuites>\n";
  return xml.str();
}

bool isJunitHead(std::string_view head) {
  constexpr std::string_view kBlanks = " \t\r\n";
  constexpr std::string_view kByteOrderMark = "\xef\xbb\xbf";
  if (head.starts_with(kByteOrderMark)) head.remove_prefix(kByteOrderMark.size());
  for (;;) {
    head.remove_prefix(std::min(head.find_first_not_of(kBlanks), head.size()));
    const std::string_view end = head.starts_with("<?")     ? "?>"
                                 : head.starts_with("<!--") ? "-->"
                                                            : "";
    const std::size_t at = end.empty() ? std::string_view::npos : head.find(end);
    if (at == std::string_view::npos) break;
    head.remove_prefix(at + end.size());
  }
  const std::string_view root = head.substr(0, head.find_first_of(" \t\r\n/>"));
  return head.empty() || root == "<testsuites" || root == "<testsuite";
}

}  // namespace factory_test
