// What the user sets: the environment's variables, and the system properties.
#include "settings.h"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <vector>

#include "properties.h"

namespace brimol::pc {
namespace {

constexpr const char* kNotSet = nullptr;

struct SettingsCase {
  const char* display;  // BRIMOL_DISPLAY
  const char* screen;   // BRIMOL_SCREEN
  const char* desktop;  // DISPLAY
  DisplayChoice choice;
  Size size;
  std::string error;
};

TEST(Settings, FollowTheEnvironment) {
  constexpr auto kEither = DisplayChoice::WindowIfPossible;
  const std::string wrongDisplay = ": wanted window or headless";
  const std::string wrongSize = ": wanted WIDTHxHEIGHT, each 1 to 16384";
  std::vector<SettingsCase> cases = {
      {kNotSet, kNotSet, kNotSet, kEither, {1440, 2560}, ""},
      {"", "", ":0", DisplayChoice::Window, {1440, 2560}, ""},
      {"window", "7x9", kNotSet, DisplayChoice::Window, {7, 9}, ""},
      {"headless", "1x16384", ":0", DisplayChoice::Headless, {1, 16384}, ""},
      {"Window", "1x", ":0", kEither, kDefaultScreen, "BRIMOL_DISPLAY=Window" + wrongDisplay},
      {"a\n\x7f\xc3\xa4", "", "", kEither, kDefaultScreen,
       "BRIMOL_DISPLAY=a??\xc3\xa4" + wrongDisplay},
  };
  for (const char* const size : {"abc", "x1", "0x1", "-1x1", "+1x1", "16385x1", "1x", "1x-1",
                                 "99999999999x1", "10X1", " 10x1", "1x1 ", "10x20x1"}) {
    cases.push_back(
        {"", size, "", kEither, kDefaultScreen, std::string("BRIMOL_SCREEN=") + size + wrongSize});
  }
  for (const SettingsCase& wanted : cases) {
    const auto [settings, error] = readSettings([&](const std::string& name) {
      if (name == "BRIMOL_DISPLAY") return wanted.display;
      if (name == "BRIMOL_SCREEN") return wanted.screen;
      return name == "DISPLAY" ? wanted.desktop : kNotSet;
    });
    EXPECT_EQ(settings.display, wanted.choice) << wanted.error;
    EXPECT_EQ(settings.screen, wanted.size) << wanted.error;
    EXPECT_EQ(error, wanted.error);
  }
}

TEST(Properties, AreReadBackWithinTheirBound) {
  std::array<char, BRIMOL_PROPERTY_BYTES + 1> room = {};
  room.back() = '#';
  const auto read = [&room](const char* key, const char* fallback) {
    EXPECT_EQ(property_get(key, room.data(), fallback), property_get(key, nullptr, fallback));
    return std::string(room.data());
  };
  const std::string longest(91, 'v');
  EXPECT_EQ(read("test.model", (longest + "v").c_str()), longest);
  EXPECT_EQ(read(nullptr, nullptr), "");
  EXPECT_EQ(property_set("test.model", "first"), 0);
  EXPECT_EQ(property_set("test.model", longest.c_str()), 0);
  EXPECT_EQ(property_set("test.model", (longest + "w").c_str()), -1);
  EXPECT_EQ(read("test.model", "none"), longest);
  EXPECT_EQ(property_set("test.model", nullptr), 0);
  EXPECT_EQ(read("test.model", "none"), "none");
  EXPECT_EQ(property_set(nullptr, "v"), -1);
  EXPECT_EQ(room.back(), '#');
}

}  // namespace
}  // namespace brimol::pc
