#include "options.h"

#include <gmock/gmock.h>

namespace brimol::replay {
namespace {

using Words = std::vector<const char*>;
using testing::ElementsAre;
using testing::HasSubstr;

TEST(OptionsTest, BelongToTheToolBeforeTheDashesAndToTheApplicationBehind) {
  std::string error;
  const Words words = {"--dir=a=b", "x.trace", "--timeout", "0",     "--screen", "480x800",
                       "--speed=1", "--",      "app",       "--dir", "",         "--"};
  const auto options = parseOptions(words, error);
  ASSERT_TRUE(options) << error;
  EXPECT_EQ(options->directory, "a=b");
  EXPECT_EQ(options->trace, "x.trace");
  EXPECT_EQ(options->timeout.count(), 0);
  EXPECT_EQ(options->pace, Options::Pace::RealTime);
  EXPECT_THAT(options->command, ElementsAre("app", "--dir", "", "--"));
  EXPECT_EQ(parseOptions(Words{"-h"}, error)->action, Options::Action::Help);
  EXPECT_EQ(parseOptions(Words{"--version"}, error)->action, Options::Action::Version);
}

struct WrongLine {
  const char* name;
  Words words;
  const char* says;
};
class WrongLines : public testing::TestWithParam<WrongLine> {};

TEST_P(WrongLines, AreNamedInOneLine) {
  std::string error;
  EXPECT_FALSE(parseOptions(GetParam().words, error));
  EXPECT_THAT(error, HasSubstr(GetParam().says));
  EXPECT_EQ(error.find('\n'), std::string::npos);
}

INSTANTIATE_TEST_SUITE_P(
    Options, WrongLines,
    testing::Values(
        WrongLine{"Nothing", {}, "which trace"}, WrongLine{"NoApplication", {"t"}, "which app"},
        WrongLine{"EmptyApplication", {"t", "--", ""}, "which app"},
        WrongLine{"NoDashes", {"t", "app"}, "is there a --"},
        WrongLine{"Unknown", {"--frob", "t", "--", "a"}, "--frob"},
        WrongLine{"UnknownShort", {"-x", "t", "--", "a"}, "-x"},
        WrongLine{"ValueMissing", {"t", "--dir"}, "--dir needs a value: DIR"},
        WrongLine{"ValueTooMuch", {"--help=1"}, "takes no value"},
        WrongLine{"EmptyFile", {"--junit=", "t", "--", "a"}, "FILE.xml"},
        WrongLine{"Speed", {"--speed", "2", "t", "--", "a"}, "does not take '2'"},
        WrongLine{"Screen", {"--screen", "480", "t", "--", "a"}, "WIDTHxHEIGHT"},
        WrongLine{"NegativeScreen", {"--screen=-1x5", "t", "--", "a"}, "WIDTHxHEIGHT"},
        WrongLine{"HugeScreen", {"--screen=9999999x5", "t", "--", "a"}, "WIDTHxHEIGHT"},
        WrongLine{"Timeout", {"--timeout=1s", "t", "--", "a"}, "SECONDS"},
        WrongLine{"TwoTraces", {"--from-bundle", "b", "t", "--", "a"}, "one of the two"},
        WrongLine{"BundleAgainst",
                  {"--from-bundle", "b", "--against", "d", "--", "a"},
                  "--against does not go"},
        WrongLine{"SameFiles", {"--junit=f", "--report=./f", "t", "--", "a"}, "written over"},
        WrongLine{"FileOfTheApplication", {"--bundle=p", "t", "--", "a", "p"}, "written over"}),
    [](const auto& given) { return given.param.name; });

}  // namespace
}  // namespace brimol::replay
