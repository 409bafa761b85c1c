#include "results/junit.h"

#include <algorithm>
#include <iomanip>
#include <sstream>

#include "results/utc_time.h"
#include "results/whole_file.h"
#include "xml/xml_text.h"

namespace factory_test {

namespace {

using brimol::xml::escaped;

constexpr int kSecondDecimals = 3;

const char* verdictElement(Verdict verdict) {
  switch (verdict) {
    case Verdict::Pass: return "";
    case Verdict::Fail: return "      <failure message=\"FAIL\"/>\n";
    default: return "      <skipped/>\n";
  }
}

void addCase(std::ostream& xml, const TestResult& result) {
  const std::chrono::duration<double> seconds = result.duration;
  const auto [width, height] = result.screen;
  xml << R"(    <testcase classname="factory_test" name=")" << escaped(result.test) << R"(" time=")"
      << seconds.count() << R"(">
      <properties>
        <property name="started" value=")"
      << utcText(result.started) << R"("/>
        <property name="screen" value=")"
      << width << 'x' << height << R"("/>
      </properties>
)" << verdictElement(result.verdict)
      << "    </testcase>\n";
}

}  // namespace

std::string junitXml(std::span<const TestResult> results) {
  std::ostringstream xml;
  xml << std::fixed << std::setprecision(kSecondDecimals)
      << R"(<?xml version="1.0" encoding="UTF-8"?>
<testsuites>
  <testsuite name="factory_test" tests=")"
      << results.size() << R"(" failures=")"
      << std::ranges::count(results, Verdict::Fail, &TestResult::verdict) << R"(" skipped=")"
      << std::ranges::count(results, Verdict::None, &TestResult::verdict) << "\">\n";
  for (const TestResult& result : results) addCase(xml, result);
  xml << "  </testsuite>\n</testsuites>\n";
  return xml.str();
}

bool writeJunit(const std::filesystem::path& path, std::span<const TestResult> results,
                std::string& error) {
  return replaceFile(path, junitXml(results), error);
}

}  // namespace factory_test
