#include "host/settings.h"

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace brimol::pc {
namespace {

struct SettingsCase {
  const char* name;
  const char* display;  // BRIMOL_DISPLAY
  const char* screen;   // BRIMOL_SCREEN
  const char* desktop;  // DISPLAY
  DisplayChoice choice;
  Size size;
  const char* error = "";
};

constexpr const char* kWrongWord = "BRIMOL_DISPLAY=Window: wanted window or headless";
constexpr const char* kWrongBytes = "BRIMOL_DISPLAY=a??: wanted window or headless";
constexpr auto kCases = std::to_array<SettingsCase>({
    {"nothing is set", nullptr, nullptr, nullptr, DisplayChoice::WindowIfPossible, {1440, 2560}},
    {"on a desktop", "", "", ":0", DisplayChoice::Window, {1440, 2560}},
    {"a window", "window", "7x9", nullptr, DisplayChoice::Window, {7, 9}},
    {"headless", "headless", "1x16384", ":0", DisplayChoice::Headless, {1, 16384}},
    {"the first of two",
     "Window",
     "1x",
     ":0",
     DisplayChoice::WindowIfPossible,
     {1440, 2560},
     kWrongWord},
    {"no letters", "a\n\x7f", "", "", DisplayChoice::WindowIfPossible, {1440, 2560}, kWrongBytes},
});

SettingsResult read(const char* display, const char* screen, const char* desktop) {
  return readSettings([=](const std::string& name) -> const char* {
    if (name == "BRIMOL_DISPLAY") return display;
    if (name == "BRIMOL_SCREEN") return screen;
    return name == "DISPLAY" ? desktop : nullptr;
  });
}

TEST(Settings, FollowTheEnvironment) {
  for (const SettingsCase& each : kCases) {
    SCOPED_TRACE(each.name);
    const auto [settings, error] = read(each.display, each.screen, each.desktop);
    EXPECT_EQ(settings.display, each.choice);
    EXPECT_EQ(settings.screen, each.size);
    EXPECT_EQ(error, each.error);
  }
}

TEST(Settings, TellASizeThatIsNone) {
  for (const char* const size : {"abc", "x1", "0x1", "-1x1", "+1x1", "16385x1", "1x", "1x-1",
                                 "99999999999x1", "10X1", " 10x1", "1x1 ", "10x20x1"}) {
    EXPECT_EQ(read("", size, "").error,
              std::string("BRIMOL_SCREEN=") + size + ": wanted WIDTHxHEIGHT, each 1 to 16384");
  }
}

}  // namespace
}  // namespace brimol::pc
