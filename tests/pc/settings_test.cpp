#include "settings.h"

#include <gtest/gtest.h>

#include <array>
#include <cstring>

namespace brimol::pc {
namespace {

struct SettingsCase {
  const char* name;
  const char* display;  // BRIMOL_DISPLAY
  const char* screen;   // BRIMOL_SCREEN
  const char* desktop;  // DISPLAY
  DisplayChoice choice;
  Size size;
  const char* error;
};

const auto kNotSet = static_cast<const char*>(nullptr);
constexpr auto kWindow = DisplayChoice::Window;
constexpr auto kEither = DisplayChoice::WindowIfPossible;
constexpr auto kHeadless = DisplayChoice::Headless;

const auto kCases = std::to_array<SettingsCase>({
    {"Nothing", kNotSet, kNotSet, kNotSet, kEither, kDefaultScreen, ""},
    {"Empty", "", "", "", kEither, kDefaultScreen, ""},
    {"Desktop", kNotSet, kNotSet, ":0", kWindow, kDefaultScreen, ""},
    {"HeadlessOnADesktop", "headless", "1x16384", ":0", kHeadless, {1, 16384}, ""},
    {"WindowWithoutDesktop", "window", "720x1280", kNotSet, kWindow, {720, 1280}, ""},
    {"WrongDisplay", "tv", kNotSet, kNotSet, kEither, kDefaultScreen,
     "BRIMOL_DISPLAY=tv: wanted window or headless"},
    {"FirstOfTwo", "Window", "1x", kNotSet, kEither, kDefaultScreen,
     "BRIMOL_DISPLAY=Window: wanted window or headless"},
    {"OneLine", "a\nb\x7f\xc3\xa4", kNotSet, kNotSet, kEither, kDefaultScreen,
     "BRIMOL_DISPLAY=a?b?\xc3\xa4: wanted window or headless"},
});

class SettingsTest : public testing::TestWithParam<SettingsCase> {};

TEST_P(SettingsTest, FollowTheEnvironment) {
  const SettingsCase& wanted = GetParam();
  const SettingsResult result = readSettings([&](const char* name) {
    if (std::strcmp(name, "BRIMOL_DISPLAY") == 0) return wanted.display;
    if (std::strcmp(name, "BRIMOL_SCREEN") == 0) return wanted.screen;
    return std::strcmp(name, "DISPLAY") == 0 ? wanted.desktop : kNotSet;
  });
  EXPECT_EQ(result.settings.display, wanted.choice);
  EXPECT_EQ(result.settings.screen, wanted.size);
  EXPECT_EQ(result.error, wanted.error);
}

INSTANTIATE_TEST_SUITE_P(All, SettingsTest, testing::ValuesIn(kCases),
                         [](const auto& row) { return row.param.name; });

class WrongScreen : public testing::TestWithParam<std::string> {};

TEST_P(WrongScreen, IsNamedAndLeavesTheDefault) {
  const SettingsResult result = readSettings([&](const char* name) {
    return std::strcmp(name, "BRIMOL_SCREEN") == 0 ? GetParam().c_str() : kNotSet;
  });
  const std::string shown = GetParam().size() > 60 ? GetParam().substr(0, 60) + "..." : GetParam();
  EXPECT_EQ(result.error, "BRIMOL_SCREEN=" + shown + ": wanted WIDTHxHEIGHT, each 1 to 16384");
  EXPECT_EQ(result.settings.screen, kDefaultScreen);
}

INSTANTIATE_TEST_SUITE_P(All, WrongScreen,
                         testing::Values("abc", "x", "10", "10x", "x10", "0x10", "10x0", "-1x10",
                                         "+1x10", "16385x1", "1x16385", "99999999999x1", "10X20",
                                         " 10x20", "10x20 ", "10x20x30", std::string(61, '1')));

}  // namespace
}  // namespace brimol::pc
