#include "results/junit.h"

#include <algorithm>
#include <cstdint>
#include <string_view>
#include <vector>

#include "results/atomic_file.h"
#include "results/utc_time.h"
#include "results/utf8.h"

namespace factory_test {

namespace {

constexpr std::string_view kSuite = "factory_test";
constexpr std::size_t kLongestReport = std::size_t{1} << 24;  // bytes
constexpr char kFirstPrintable = ' ';
constexpr int64_t kMillisecondsPerSecond = 1000;
constexpr std::size_t kMillisecondDigits = 3;

// UTF-8's own last two characters, which XML does not know.
constexpr std::string_view kNoCharacterFffe = "\xef\xbf\xbe";
constexpr std::string_view kNoCharacterFfff = "\xef\xbf\xbf";

bool isSpace(char letter) { return letter == '\t' || letter == '\n' || letter == '\r'; }

bool isControl(char letter) { return letter >= '\0' && letter < kFirstPrintable; }

std::string escaped(char letter) {
  switch (letter) {
    case '&': return "&amp;";
    case '<': return "&lt;";
    case '>': return "&gt;";
    case '"': return "&quot;";
    default: break;
  }
  // As a reference: a reader turns spaces in an attribute into blanks.
  if (isSpace(letter)) return "&#" + std::to_string(int{letter}) + ";";
  return isControl(letter) ? std::string(kReplacement) : std::string(1, letter);
}

std::string escaped(std::string_view utf8) {
  std::string text;
  while (!utf8.empty()) {
    if (utf8.starts_with(kNoCharacterFffe) || utf8.starts_with(kNoCharacterFfff)) {
      text += kReplacement;
      utf8.remove_prefix(kNoCharacterFffe.size());
    } else {
      text += escaped(utf8.front());
      utf8.remove_prefix(1);
    }
  }
  return text;
}

std::string attribute(std::string_view name, std::string_view value) {
  return std::string(" ").append(name).append("=\"").append(escaped(value)).append("\"");
}

std::string attribute(std::string_view name, int64_t number) {
  return attribute(name, std::to_string(number));
}

std::string secondsText(std::chrono::milliseconds duration) {
  const int64_t count = duration.count();
  const std::string rest = std::to_string(count % kMillisecondsPerSecond);
  return std::to_string(count / kMillisecondsPerSecond) + "." +
         std::string(kMillisecondDigits - rest.size(), '0') + rest;
}

std::string screenText(ScreenSize screen) {
  return std::to_string(screen.width) + "x" + std::to_string(screen.height);
}

std::string property(std::string_view name, std::string_view value) {
  return "        <property" + attribute("name", name) + attribute("value", value) + "/>\n";
}

std::string_view verdictElement(Verdict verdict) {
  switch (verdict) {
    case Verdict::Pass: return "";
    case Verdict::Fail: return "      <failure message=\"FAIL\"/>\n";
    default: return "      <skipped/>\n";
  }
}

std::string testCase(const TestResult& result) {
  std::string text = "    <testcase" + attribute("classname", kSuite) +
                     attribute("name", result.test) +
                     attribute("time", secondsText(result.duration)) + ">\n";
  text += "      <properties>\n" + property("started", utcText(result.started)) +
          property("screen", screenText(result.screen)) + "      </properties>\n";
  return text.append(verdictElement(result.verdict)).append("    </testcase>\n");
}

// When the first test began. The report's format has no place for a time zone; it is UTC.
std::string timestamp(std::span<const TestResult> results) {
  if (results.empty()) return {};
  std::string text = utcText(std::ranges::min_element(results, {}, &TestResult::started)->started);
  text.pop_back();
  return attribute("timestamp", text);
}

std::string suiteStart(std::span<const TestResult> results) {
  std::chrono::milliseconds total(0);
  for (const TestResult& result : results) total += result.duration;
  return "  <testsuite" + attribute("name", kSuite) + attribute("tests", std::ssize(results)) +
         attribute("failures", std::ranges::count(results, Verdict::Fail, &TestResult::verdict)) +
         attribute("skipped", std::ranges::count(results, Verdict::None, &TestResult::verdict)) +
         attribute("time", secondsText(total)) + timestamp(results) + ">\n";
}

}  // namespace

std::string junitXml(std::span<const TestResult> results) {
  std::vector<TestResult> cases(results.begin(), results.end());
  std::ranges::transform(cases, cases.begin(), storable);
  std::string text = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<testsuites>\n";
  text += suiteStart(cases);
  for (const TestResult& result : cases) text += testCase(result);
  return text + "  </testsuite>\n</testsuites>\n";
}

bool writeJunit(const std::filesystem::path& path, std::span<const TestResult> results,
                std::string& error) {
  auto file = AtomicFile::own(path, kLongestReport, error);
  return file && file->replace(junitXml(results), error);
}

}  // namespace factory_test
