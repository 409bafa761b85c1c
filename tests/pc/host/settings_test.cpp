#include "host/settings.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <string>

#include "host/devices.h"

namespace brimol::pc {
namespace {

struct SettingsCase {
  const char* name;
  const char* display;  // BRIMOL_DISPLAY
  const char* device;   // BRIMOL_DEVICE
  const char* screen;   // BRIMOL_SCREEN
  const char* desktop;  // DISPLAY
  DisplayChoice choice;
  Size size;
  float density = kDefaultDensity;
  const char* error = "";
};

constexpr DisplayChoice kIfPossible = DisplayChoice::WindowIfPossible;
constexpr const char* kWrongWord = "BRIMOL_DISPLAY=Window: wanted window, browser or headless";
constexpr const char* kWrongDevice =
    "BRIMOL_DEVICE=wvga: wanted hvga-3.2, wvga-4.0, hd-4.7, fhd-5.0, wqhd-5.5, hdplus-6.5, "
    "fhdplus-6.5 or wqhdplus-6.8";
constexpr const char* kWrongBytes = "BRIMOL_DISPLAY=a??: wanted window, browser or headless";
constexpr auto kCases = std::to_array<SettingsCase>({
    {"nothing is set", nullptr, nullptr, nullptr, nullptr, kIfPossible, kDefaultScreen},
    {"on a desktop", "", "", "", ":0", DisplayChoice::Window, kDefaultScreen},
    {"a window", "window", nullptr, "7x9", nullptr, DisplayChoice::Window, {7, 9}},
    {"headless", "headless", "", "1x16384", ":0", DisplayChoice::Headless, {1, 16384}},
    {"a browser", "browser", "", "", ":0", DisplayChoice::Browser, kDefaultScreen},
    {"a device", "", "wvga-4.0", "", "", kIfPossible, {480, 800}, 233.2f},
    {"its size alone", "", "wvga-4.0", "9x9", "", kIfPossible, {9, 9}, 233.2f},
    {"no device", "", "wvga", "1x", "", kIfPossible, kDefaultScreen, kDefaultDensity, kWrongDevice},
    {"the first of two", "Window", "", "1x", ":0", kIfPossible, kDefaultScreen, kDefaultDensity,
     kWrongWord},
    {"no letters", "a\n\x7f", "", "", "", kIfPossible, kDefaultScreen, kDefaultDensity,
     kWrongBytes},
});

SettingsResult read(const char* display, const char* device, const char* screen,
                    const char* desktop) {
  return readSettings([=](const std::string& name) -> const char* {
    if (name == "BRIMOL_DISPLAY") return display;
    if (name == "BRIMOL_DEVICE") return device;
    if (name == "BRIMOL_SCREEN") return screen;
    return name == "DISPLAY" ? desktop : nullptr;
  });
}

TEST(Settings, FollowTheEnvironment) {
  for (const SettingsCase& each : kCases) {
    SCOPED_TRACE(each.name);
    const auto [settings, error] = read(each.display, each.device, each.screen, each.desktop);
    EXPECT_EQ(settings.display, each.choice);
    EXPECT_EQ(settings.screen, each.size);
    EXPECT_EQ(settings.density, each.density);
    EXPECT_EQ(error, each.error);
  }
}

TEST(Settings, TellASizeThatIsNone) {
  for (const char* const size : {"abc", "x1", "0x1", "-1x1", "+1x1", "16385x1", "1x", "1x-1",
                                 "99999999999x1", "10X1", " 10x1", "1x1 ", "10x20x1"}) {
    EXPECT_EQ(read("", "", size, "").error,
              std::string("BRIMOL_SCREEN=") + size + ": wanted WIDTHxHEIGHT, each 1 to 16384");
  }
}

TEST(Settings, TellWhereBrowsersConnect) {
  const auto listenAt = [](const char* value) {
    return readSettings([value](const std::string& name) -> const char* {
      return name == "BRIMOL_LISTEN" ? value : nullptr;
    });
  };
  EXPECT_FALSE(listenAt("").settings.listen);
  EXPECT_EQ(listenAt("10.0.0.7:0").settings.listen->host, "10.0.0.7");
  EXPECT_EQ(listenAt("bench:1").error,
            "BRIMOL_LISTEN=bench:1: wanted ADDRESS:PORT, such as 127.0.0.1:5800 or [::1]:0");
}

TEST(Devices, HaveTheDiagonalThatTheirNamesSay) {
  for (const BrimolDevice& device : devices()) {
    const std::string name = device.name;
    const double inches = std::hypot(device.width, device.height) / device.density;
    EXPECT_NEAR(inches, std::stod(name.substr(name.find('-') + 1)), 0.01) << name;
    EXPECT_EQ(brimol_device_named(device.name), &device);
  }
  EXPECT_EQ(brimol_device_named(nullptr), nullptr);
}

}  // namespace
}  // namespace brimol::pc
