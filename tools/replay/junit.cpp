#include "junit.h"

#include <algorithm>
#include <iomanip>
#include <map>
#include <sstream>
#include <vector>

#include "xml/xml_text.h"

namespace brimol::replay {

namespace {

using xml::escaped;

constexpr std::size_t kMostOutputBytes = std::size_t{64} << 10;
constexpr int kSecond = 1000;
constexpr int kSecondDecimals = 3;

struct Case {
  std::string name;
  int64_t ms = 0;
  bool isError = false;
  std::string message = {};  // empty: it passed
  std::string detail = {};
};

// A step that is met again, in an included file, has a number behind its name.
std::string uniqueName(const std::string& name, std::map<std::string, int>& known) {
  const int count = ++known[name];
  return count == 1 ? name : name + " (" + std::to_string(count) + ")";
}

std::vector<Case> casesOf(const Session& session, const Judgement& judgement) {
  std::vector<Case> cases;
  std::map<std::string, int> known;
  int64_t before = 0;
  for (const Happening& one : session.happenings) {
    if (one.kind != Happening::Kind::Expectation) continue;
    Case added{uniqueName(one.place.text() + " " + one.text, known), one.time - before};
    before = one.time;
    if (!one.passed) {
      added.message = one.why.empty() ? "failed" : one.why.substr(0, one.why.find('\n'));
      added.detail = one.why;
    }
    cases.push_back(std::move(added));
  }
  Case whole{"the whole session", session.lastTime - before};
  if (judgement.verdict != Verdict::Passed) {
    whole.isError = judgement.verdict != Verdict::Failed;
    whole.message = judgement.headline;
    whole.detail = judgement.place.text() + "\n" + judgement.detail;
  }
  cases.push_back(std::move(whole));
  return cases;
}

std::string secondsText(int64_t ms) {
  std::ostringstream text;
  text << std::fixed << std::setprecision(kSecondDecimals)
       << static_cast<double>(std::max<int64_t>(ms, 0)) / kSecond;
  return text.str();
}

void write(const Case& one, const std::string& className, std::ostream& xml) {
  xml << R"(    <testcase classname=")" << className << R"(" name=")" << escaped(one.name)
      << R"(" time=")" << secondsText(one.ms) << '"';
  if (one.message.empty()) {
    xml << "/>\n";
    return;
  }
  const char* const element = one.isError ? "error" : "failure";
  xml << ">\n      <" << element << R"( message=")" << escaped(one.message) << "\">"
      << escaped(one.detail) << "</" << element << ">\n    </testcase>\n";
}

}  // namespace

std::string junitXml(const std::string& trace, const Session& session, const Judgement& judgement,
                     const std::string& output) {
  const std::vector<Case> cases = casesOf(session, judgement);
  const auto failed = [](const Case& one) { return !one.message.empty() && !one.isError; };
  const std::string name = escaped(trace);
  std::ostringstream xml;
  xml << R"(<?xml version="1.0" encoding="UTF-8"?>
<testsuites>
  <testsuite name=")"
      << name << R"(" tests=")" << cases.size() << R"(" failures=")"
      << std::ranges::count_if(cases, failed) << R"(" errors=")"
      << std::ranges::count(cases, true, &Case::isError) << R"(" time=")"
      << secondsText(session.lastTime) << "\">\n";
  for (const Case& one : cases) write(one, name, xml);
  const std::size_t skipped = output.size() - std::min(output.size(), kMostOutputBytes);
  xml << "    <system-out>" << escaped(output.substr(skipped))
      << "</system-out>\n  </testsuite>\n</testsuites>\n";
  return xml.str();
}

}  // namespace brimol::replay
