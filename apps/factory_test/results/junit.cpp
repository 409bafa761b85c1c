#include "results/junit.h"

#include <algorithm>
#include <iomanip>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string_view>

#include "results/utc_time.h"
#include "results/whole_file.h"

namespace factory_test {

namespace {

using nlohmann::json;

constexpr std::string_view kReplacement = "\xef\xbf\xbd";  // U+FFFD, for what is no character
constexpr int kSecondDecimals = 3;

// The JSON library checks the texts that it writes.
std::string validUtf8(std::string_view bytes) {
  return json::parse(json(bytes).dump(-1, ' ', false, json::error_handler_t::replace))
      .get<std::string>();
}

std::string escaped(char letter) {
  switch (letter) {
    case '&': return "&amp;";
    case '<': return "&lt;";
    case '"': return "&quot;";
    default: break;
  }
  const bool isControl = letter >= '\0' && letter < ' ';
  return isControl ? std::string(kReplacement) : std::string(1, letter);
}

std::string escaped(std::string_view bytes) {
  std::string text;
  for (const char letter : validUtf8(bytes)) text += escaped(letter);
  // UTF-8's own last two characters, which XML does not know.
  for (const std::string_view unknown : {"\xef\xbf\xbe", "\xef\xbf\xbf"}) {
    for (auto at = text.find(unknown); at != std::string::npos; at = text.find(unknown, at)) {
      text.replace(at, unknown.size(), kReplacement);
    }
  }
  return text;
}

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
