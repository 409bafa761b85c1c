#include "junit.h"

#include <gmock/gmock.h>

#include <cstdlib>

#include "paths.h"
#include "runs.h"

namespace brimol::replay {
namespace {

using testing::HasSubstr;

class Junit : public InFolder {
 protected:
  // As xmllint sees it.
  bool isValid(const std::string& xml) const {
    const auto file = write("report.xml", xml);
    const std::string command =
        std::string(kXmllint) + " --noout --schema " + kJunitSchema + " " + file.native() + " 2>&1";
    return std::system(command.c_str()) == 0;
  }
};

constexpr auto kMet =
    R"({"kind":"expectation","time":100,"file":"a.trace","line":4,"text":"expect \"<A> & B\"","passed":true})"
    "\n";
constexpr auto kMissed =
    R"({"kind":"expectation","time":2100,"file":"a.trace","line":4,"text":"expect \"<A> & B\"","passed":false,"why":"it is\nnot there"})"
    "\n";

TEST_F(Junit, HasACaseForEachExpectationAndOneForAll) {
  const Session session = sessionOf(std::string(kMet) + kMissed);
  const Judgement judgement = {Verdict::Failed, "It failed.", "", {"a.trace", 4}};
  const std::string xml = junitXml("a.trace", session, judgement, "out");
  EXPECT_TRUE(isValid(xml)) << xml;
  EXPECT_THAT(xml, HasSubstr(R"(tests="3" failures="2" errors="0" time="2.100")"));
  EXPECT_THAT(xml,
              HasSubstr(R"(name="a.trace:4 expect &quot;&lt;A&gt; &amp; B&quot;" time="0.100"/>)"));
  EXPECT_THAT(xml, HasSubstr(R"x(B&quot; (2)" time="2.000">)x"));
  EXPECT_THAT(xml, HasSubstr(R"(<failure message="it is">it is&#10;not there</failure>)"));
}

TEST_F(Junit, CallsACrashAnError) {
  const Judgement judgement = {Verdict::Crashed, "It crashed.", "", {}};
  const std::string xml = junitXml("a.trace", {}, judgement, "");
  EXPECT_TRUE(isValid(xml)) << xml;
  EXPECT_THAT(xml, HasSubstr(R"(tests="1" failures="0" errors="1")"));
}

TEST_F(Junit, HoldsAnyBytes) {
  std::string all;
  for (int byte = 0; byte < 0x100; ++byte) all += static_cast<char>(byte);
  all += "\xef\xbf\xbe\xef\xbf\xbf]]>";
  const std::string xml = junitXml(all, {}, {Verdict::Failed, all, all, {all, 1}}, all);
  EXPECT_TRUE(isValid(xml)) << xml;
}

}  // namespace
}  // namespace brimol::replay
