#include "host/settings.h"

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace brimol::pc {
namespace {

// What the environment's BRIMOL_DISPLAY, BRIMOL_SCREEN and DISPLAY lead to.
std::string textFor(const char* display, const char* screen, const char* desktop) {
  const auto [settings, error] = readSettings([=](const std::string& name) -> const char* {
    if (name == "BRIMOL_DISPLAY") return display;
    if (name == "BRIMOL_SCREEN") return screen;
    return name == "DISPLAY" ? desktop : nullptr;
  });
  constexpr auto kChoices = std::to_array<const char*>({"window", "either", "headless"});
  return kChoices.at(static_cast<std::size_t>(settings.display)) + std::string(" ") +
         std::to_string(settings.screen.w) + "x" + std::to_string(settings.screen.h) + error;
}

TEST(Settings, FollowTheEnvironment) {
  const std::string wanted = ": wanted window or headless";
  EXPECT_EQ(textFor(nullptr, nullptr, nullptr), "either 1440x2560");
  EXPECT_EQ(textFor("", "", ":0"), "window 1440x2560");
  EXPECT_EQ(textFor("window", "7x9", nullptr), "window 7x9");
  EXPECT_EQ(textFor("headless", "1x16384", ":0"), "headless 1x16384");
  EXPECT_EQ(textFor("Window", "1x", ":0"), "either 1440x2560BRIMOL_DISPLAY=Window" + wanted);
  EXPECT_EQ(textFor("a\n\x7f", "", ""), "either 1440x2560BRIMOL_DISPLAY=a??" + wanted);
  for (const char* const size : {"abc", "x1", "0x1", "-1x1", "+1x1", "16385x1", "1x", "1x-1",
                                 "99999999999x1", "10X1", " 10x1", "1x1 ", "10x20x1"}) {
    EXPECT_EQ(textFor("", size, ""), std::string("either 1440x2560BRIMOL_SCREEN=") + size +
                                         ": wanted WIDTHxHEIGHT, each 1 to 16384");
  }
}

}  // namespace
}  // namespace brimol::pc
