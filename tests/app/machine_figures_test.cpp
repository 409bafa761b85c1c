#include "results/machine_figures.h"

#include <arpa/inet.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <sstream>
#include <vector>

#include "scratch.h"

namespace factory_test {
namespace {

struct DeviceFile {
  std::string device, name, text;
};

struct Machine {
  const char* name;
  std::vector<DeviceFile> files;  // in the system's class directory
  const char* battery;
  const char* charger;
  const char* brightness;
};
class MachineFiguresOf : public testing::TestWithParam<Machine> {};

TEST_P(MachineFiguresOf, AreThoseOfItsDevices) {
  const Scratch scratch;
  for (const auto& [device, name, text] : GetParam().files) {
    scratch.write(std::filesystem::path("class") / device / name, text);
  }
  const MachineFigures figures = readMachineFigures(scratch.at(""));
  EXPECT_EQ(figures.battery, GetParam().battery);
  EXPECT_EQ(figures.charger, GetParam().charger);
  EXPECT_EQ(figures.brightness, GetParam().brightness);
}

std::vector<DeviceFile> battery(const std::string& capacity, const std::string& status) {
  return {{"power_supply/BAT0", "type", "Battery\n"},
          {"power_supply/BAT0", "capacity", capacity},
          {"power_supply/BAT0", "status", status}};
}

std::vector<DeviceFile> with(std::vector<DeviceFile> files, const std::vector<DeviceFile>& more) {
  files.insert(files.end(), more.begin(), more.end());
  return files;
}

std::vector<DeviceFile> light(const std::string& level, const std::string& most) {
  return {{"backlight/panel", "brightness", level}, {"backlight/panel", "max_brightness", most}};
}

const std::vector<DeviceFile> kMains = {{"power_supply/AC", "type", "Mains\n"},
                                        {"power_supply/AC", "online", "1\n"}};
const std::vector<DeviceFile> kMainsOff = {{"power_supply/AC", "type", "Mains\n"},
                                           {"power_supply/AC", "online", "0\n"}};
const std::vector<DeviceFile> kUsb = {{"power_supply/usb", "type", "USB\n"},
                                      {"power_supply/usb", "online", "2\n"}};
const std::vector<DeviceFile> kMouse = {{"power_supply/A", "type", "Battery\n"},
                                        {"power_supply/A", "scope", "Device\n"},
                                        {"power_supply/A", "capacity", "3\n"}};
constexpr auto kNoLight = "Light n/a";
constexpr auto kNone = "No battery";
constexpr auto kHuge = "99999999999999999999";

INSTANTIATE_TEST_SUITE_P(
    All, MachineFiguresOf,
    testing::Values(
        Machine{"Bench", {}, kNone, "Mains", kNoLight},
        Machine{"Charging", battery("57\n", "Charging\n"), "Battery 57%", "Charging", kNoLight},
        Machine{"Unplugged", with(battery("0\n", "Discharging\n"), kMainsOff), "Battery 0%",
                "On battery", kNoLight},
        Machine{"Full", with(battery("100\n", "Full\n"), kMains), "Battery 100%", "Mains",
                kNoLight},
        Machine{"FullOnUsb", with(battery("100\n", "Not charging\n"), kUsb), "Battery 100%",
                "Mains", kNoLight},
        Machine{"Mouse", kMouse, kNone, "Mains", kNoLight},
        Machine{"MouseFirst", with(kMouse, battery("64", "Unknown")), "Battery 64%", "On battery",
                kNoLight},
        Machine{"MoreThanFull", battery("101\n", "Charging\n"), kNone, "Mains", kNoLight},
        Machine{"Negative", battery("-1\n", ""), kNone, "Mains", kNoLight},
        Machine{"HugeCapacity", battery(kHuge, ""), kNone, "Mains", kNoLight},
        Machine{"Garbage", battery(std::string("5\0 7", 4), "\xff\xfe"), kNone, "Mains", kNoLight},
        Machine{"LongCapacity", battery("57" + std::string(100'000, '\n'), ""), kNone, "Mains",
                kNoLight},
        Machine{"Dim", light("1\n", "1000\n"), kNone, "Mains", "Light 0%"},
        Machine{"Bright", light("937\n", "937\n"), kNone, "Mains", "Light 100%"},
        Machine{"FineSteps", light("9223372036854775806", "9223372036854775807"), kNone, "Mains",
                "Light 100%"},
        Machine{"NoSteps", light("0\n", "0\n"), kNone, "Mains", kNoLight},
        Machine{"OverItsMost", light("11\n", "10\n"), kNone, "Mains", kNoLight},
        Machine{"Blank", light("63 \n", "100"), kNone, "Mains", kNoLight},
        Machine{"SecondPanel", with({{"backlight/a", "brightness", "x"}}, light("63\n", "100")),
                kNone, "Mains", "Light 63%"}),
    [](const auto& row) { return row.param.name; });

TEST(MachineFigures, DoNotWaitForWhatIsNoFile) {
  const Scratch scratch;
  std::filesystem::create_directories(scratch.at("class/backlight/panel/brightness"));
  std::filesystem::create_directories(scratch.at("class/power_supply/BAT0"));
  std::filesystem::create_symlink("BAT0", scratch.at("class/power_supply/BAT1"));
  ASSERT_EQ(::mkfifo(scratch.at("class/power_supply/BAT0/type").c_str(), 0600), 0);
  const MachineFigures figures = readMachineFigures(scratch.at(""));
  EXPECT_EQ(figures.battery, "No battery");
  EXPECT_EQ(figures.brightness, "Light n/a");
}

TEST(MachineFigures, AreShortTextsOfThisMachine) {
  const MachineFigures figures = readMachineFigures();
  for (const auto& text : {figures.battery, figures.charger, figures.brightness, figures.hostName,
                           figures.address, figures.load}) {
    EXPECT_TRUE(!text.empty() && text.size() <= kFigureBytes) << text;
    EXPECT_TRUE(std::ranges::all_of(text, [](char c) { return c >= ' ' && c <= '~'; })) << text;
  }
  std::array<char, 300> host = {};
  ASSERT_EQ(::gethostname(host.data(), host.size() - 1), 0);
  EXPECT_EQ(figures.hostName.substr(0, 22), std::string(host.data()).substr(0, 22));
  std::istringstream load(figures.load);
  std::string label;
  std::array<double, 3> loads = {-1, -1, -1};
  load >> label >> loads[0] >> loads[1] >> loads[2];
  EXPECT_TRUE(load && load.eof() && label == "Load" && *std::ranges::min_element(loads) >= 0)
      << figures.load;
  in_addr address = {};
  EXPECT_TRUE(figures.address == "No network" || figures.address.find(':') != std::string::npos ||
              ::inet_pton(AF_INET, figures.address.c_str(), &address) == 1)
      << figures.address;
  EXPECT_FALSE(figures.address.starts_with("127."));
}

}  // namespace
}  // namespace factory_test
