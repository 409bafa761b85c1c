#include "host/settings.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdlib>
#include <optional>
#include <string_view>

#include "host/devices.h"
#include "scene/quoted_text.h"

namespace brimol::pc {

namespace {

constexpr const char* kDisplayVariable = "BRIMOL_DISPLAY";
constexpr const char* kListenVariable = "BRIMOL_LISTEN";
constexpr const char* kDeviceVariable = "BRIMOL_DEVICE";
constexpr const char* kScreenVariable = "BRIMOL_SCREEN";
constexpr std::array kDesktopVariables = {"DISPLAY", "WAYLAND_DISPLAY"};
constexpr std::size_t kShownBytes = 60;  // of a wrong value

std::string_view valueOf(const VariableLookup& lookup, const char* name) {
  const char* const value = lookup(name);
  return value == nullptr ? std::string_view() : std::string_view(value);
}

std::optional<int> readSide(std::string_view digits) {
  int side = 0;
  const char* const end = digits.data() + digits.size();
  const auto [stop, problem] = std::from_chars(digits.data(), end, side);
  const bool isNumber = problem == std::errc() && stop == end;
  if (!isNumber || side < 1 || side > kMaxScreenSide) return std::nullopt;
  return side;
}

std::optional<Size> readSize(std::string_view value) {
  const std::size_t cross = value.find('x');
  if (cross == std::string_view::npos) return std::nullopt;
  const std::optional<int> width = readSide(value.substr(0, cross));
  const std::optional<int> height = readSide(value.substr(cross + 1));
  if (!width || !height) return std::nullopt;
  return Size{*width, *height};
}

bool hasDesktop(const VariableLookup& lookup) {
  return std::ranges::any_of(kDesktopVariables,
                             [&](const char* name) { return !valueOf(lookup, name).empty(); });
}

std::string readDisplay(const VariableLookup& lookup, DisplayChoice& display) {
  const std::string_view value = valueOf(lookup, kDisplayVariable);
  if (value == "headless") {
    display = DisplayChoice::Headless;
  } else if (value == "browser") {
    display = DisplayChoice::Browser;
  } else if (value == "window" || (value.empty() && hasDesktop(lookup))) {
    display = DisplayChoice::Window;
  } else if (!value.empty()) {
    return wrongValue(kDisplayVariable, value, "window, browser or headless");
  }
  return {};
}

std::string readDevice(const VariableLookup& lookup, Settings& settings) {
  const std::string value(valueOf(lookup, kDeviceVariable));
  if (value.empty()) return {};
  const BrimolDevice* const device = brimol_device_named(value.c_str());
  if (device == nullptr) return wrongValue(kDeviceVariable, value, namesOfDevices());
  settings.screen = {device->width, device->height};
  settings.density = device->density;
  settings.isDensityGiven = true;
  settings.isSizeGiven = true;
  return {};
}

std::string readListen(const VariableLookup& lookup, std::optional<ListenAddress>& listen) {
  const std::string_view value = valueOf(lookup, kListenVariable);
  if (value.empty()) return {};
  listen = parseListenAddress(value);
  if (listen) return {};
  return wrongValue(kListenVariable, value, "ADDRESS:PORT, such as 127.0.0.1:5800 or [::1]:0");
}

std::string readScreen(const VariableLookup& lookup, Settings& settings) {
  const std::string_view value = valueOf(lookup, kScreenVariable);
  if (value.empty()) return {};
  const std::optional<Size> size = readSize(value);
  if (!size) {
    return wrongValue(kScreenVariable, value,
                      "WIDTHxHEIGHT, each 1 to " + std::to_string(kMaxScreenSide));
  }
  settings.screen = *size;
  settings.isSizeGiven = true;
  return {};
}

}  // namespace

std::string wrongValue(const char* name, std::string_view value, const std::string& wanted) {
  std::string shown = printable(std::string(value.substr(0, kShownBytes)));
  if (value.size() > kShownBytes) shown += "...";
  return std::string(name) + "=" + shown + ": wanted " + wanted;
}

SettingsResult readSettings(const VariableLookup& lookup) {
  SettingsResult result;
  for (const std::string& error :
       {readDisplay(lookup, result.settings.display), readListen(lookup, result.settings.listen),
        readDevice(lookup, result.settings), readScreen(lookup, result.settings)}) {
    if (result.error.empty()) result.error = error;
  }
  return result;
}

SettingsResult readSettings() {
  return readSettings([](const char* name) -> const char* { return std::getenv(name); });
}

}  // namespace brimol::pc
