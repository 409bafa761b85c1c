#include "results/junit.h"

#include <expat.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <map>
#include <memory>
#include <vector>

#include "results/results.h"
#include "scratch.h"

namespace factory_test {
namespace {

using std::chrono::milliseconds;
using Attributes = std::map<std::string, std::string>;

struct Element {
  std::string name;
  Attributes attributes;
};

struct Document {
  std::vector<Element> elements;  // in the order of their starts
  bool isWellFormed = false;

  std::vector<std::string> values(std::string_view element, const std::string& attribute) const {
    std::vector<std::string> found;
    for (const auto& [name, attributes] : elements) {
      if (name == element) found.push_back(attributes.at(attribute));
    }
    return found;
  }
};

void startElement(void* document, const char* name, const char** attributes) {
  Element element = {name, {}};
  for (; *attributes != nullptr; attributes += 2) element.attributes[attributes[0]] = attributes[1];
  static_cast<Document*>(document)->elements.push_back(std::move(element));
}

Document parse(const std::string& xml) {
  Document document;
  const std::unique_ptr<XML_ParserStruct, decltype(&XML_ParserFree)> parser(
      XML_ParserCreate(nullptr), &XML_ParserFree);
  XML_SetUserData(parser.get(), &document);
  XML_SetStartElementHandler(parser.get(), startElement);
  document.isWellFormed =
      XML_Parse(parser.get(), xml.data(), static_cast<int>(xml.size()), XML_TRUE) == XML_STATUS_OK;
  return document;
}

constexpr std::chrono::sys_seconds kEvening =
    std::chrono::sys_days(std::chrono::year(2026) / 2 / 3) + std::chrono::hours(19);
const std::vector<TestResult> kResults = {
    {"keys", Verdict::Pass, kEvening + std::chrono::minutes(1), milliseconds(61005), {720, 1280}},
    {"touch", Verdict::Fail, kEvening, milliseconds(7), {1440, 2560}},
    {"toast", Verdict::None, kEvening + std::chrono::hours(6), milliseconds(0), {0, 0}},
};

TEST(Junit, HasASuiteWithACaseForEachResult) {
  const Document report = parse(junitXml(kResults));
  ASSERT_TRUE(report.isWellFormed);
  std::vector<std::string> names;
  for (const Element& element : report.elements) names.push_back(element.name);
  EXPECT_EQ(names, (std::vector<std::string>{"testsuites", "testsuite",                         //
                                             "testcase", "properties", "property", "property",  //
                                             "testcase", "properties", "property", "property",
                                             "failure",  //
                                             "testcase", "properties", "property", "property",
                                             "skipped"}));
  EXPECT_EQ(report.elements[1].attributes, (Attributes{{"name", "factory_test"},
                                                       {"tests", "3"},
                                                       {"failures", "1"},
                                                       {"skipped", "1"},
                                                       {"time", "61.012"},
                                                       {"timestamp", "2026-02-03T19:00:00"}}));
  EXPECT_EQ(report.elements[2].attributes,
            (Attributes{{"classname", "factory_test"}, {"name", "keys"}, {"time", "61.005"}}));
  EXPECT_EQ(report.values("property", "value"),
            (std::vector<std::string>{"2026-02-03T19:01:00Z", "720x1280",   //
                                      "2026-02-03T19:00:00Z", "1440x2560",  //
                                      "2026-02-04T01:00:00Z", "0x0"}));
}

TEST(Junit, OfNoResultsIsAnEmptySuite) {
  const Document report = parse(junitXml({}));
  ASSERT_TRUE(report.isWellFormed);
  EXPECT_EQ(report.values("testsuite", "tests"), std::vector<std::string>{"0"});
  EXPECT_EQ(report.values("testsuite", "time"), std::vector<std::string>{"0.000"});
}

struct NameCase {
  std::string name, shown;
};

TEST(Junit, KeepsEveryCharacterThatXmlKnows) {
  for (const auto& [name, shown] : std::to_array<NameCase>({
           {R"(a<b>&amp;"c'd]]>)", R"(a<b>&amp;"c'd]]>)"},
           {"\t two\r\nlines ", "\t two\r\nlines "},
           {std::string("\0\x1b\x1f\x7f", 4), "\xef\xbf\xbd\xef\xbf\xbd\xef\xbf\xbd\x7f"},
           {"\xef\xbf\xbd \xef\xbf\xbe \xef\xbf\xbf", "\xef\xbf\xbd \xef\xbf\xbd \xef\xbf\xbd"},
           {"\xd7\xa9 \xf0\x9f\x98\x80", "\xd7\xa9 \xf0\x9f\x98\x80"},
           {"\xed\xa0\x80", "\xef\xbf\xbd\xef\xbf\xbd\xef\xbf\xbd"},  // half a surrogate pair
       })) {
    const Document report = parse(junitXml(std::vector{TestResult{name}}));
    ASSERT_TRUE(report.isWellFormed) << name;
    EXPECT_EQ(report.values("testcase", "name"), std::vector{shown});
  }
}

TEST(Junit, IsWellFormedForAnyByte) {
  std::vector<TestResult> results;
  for (int byte = 0; byte < 0x100; ++byte) {
    const std::string name(1, static_cast<char>(byte));
    results.push_back({name});
    results.push_back({"\xef\xbf" + name});  // among them what is UTF-8 and yet no character
  }
  const Document report = parse(junitXml(results));
  EXPECT_TRUE(report.isWellFormed);
  EXPECT_EQ(report.values("testcase", "name").size(), results.size());
}

TEST(Junit, IsWrittenWholeOrNotAtAll) {
  const Scratch scratch;
  std::string error;
  scratch.write("report.xml", std::string(10'000, 'x'));
  ASSERT_TRUE(writeJunit(scratch.at("report.xml"), kResults, error)) << error;
  EXPECT_EQ(scratch.read("report.xml"), junitXml(kResults));
  EXPECT_EQ(scratch.names(), std::set<std::string>{"report.xml"});
  EXPECT_FALSE(writeJunit(scratch.at("missing/report.xml"), kResults, error));
  EXPECT_EQ(error, scratch.at("missing/report.xml").native() +
                       ": no lock can be made beside it: No such file or directory");
  ASSERT_EQ(::mkfifo(scratch.at("pipe").c_str(), 0600), 0);
  EXPECT_FALSE(writeJunit(scratch.at("pipe"), kResults, error));
  EXPECT_EQ(error, scratch.at("pipe").native() + ": is not a regular file");
  EXPECT_TRUE(std::filesystem::is_fifo(scratch.at("pipe")));
}

TEST(Junit, SparesTheResultsFile) {
  const Scratch scratch;
  std::string error;
  auto book = ResultBook::open(scratch.at("results.json"), error);
  ASSERT_TRUE(book->record(kResults.front(), error)) << error;
  const std::string before = scratch.read("results.json");
  EXPECT_FALSE(writeJunit(scratch.at("results.json"), kResults, error));
  EXPECT_EQ(scratch.read("results.json"), before);
}

}  // namespace
}  // namespace factory_test
