#include "results/machine_figures.h"

#include <arpa/inet.h>
#include <ifaddrs.h>
#include <net/if.h>
#include <netinet/in.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <optional>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

#include "results/file_text.h"

namespace factory_test {

namespace {

constexpr std::size_t kAttributeBytes = 4096;  // the kernel shows no longer ones
constexpr std::size_t kMostDevices = 64;
constexpr std::size_t kHostNameBytes = 256;
constexpr int64_t kWhole = 100;  // percent
constexpr std::string_view kCut = "..";

std::string figure(std::string_view text) {
  std::string shown(text);
  std::ranges::replace_if(
      shown, [](char letter) { return letter < ' ' || letter > '~'; }, '?');
  if (shown.size() <= kFigureBytes) return shown;
  return shown.substr(0, kFigureBytes - kCut.size()).append(kCut);
}

std::string percentText(std::string_view label, int64_t percent) {
  return std::string(label).append(" ").append(std::to_string(percent)).append("%");
}

// A device's attribute without the line's end; empty: it has none.
std::string attribute(const std::filesystem::path& device, std::string_view name) {
  std::string text = readFile(device / name, kAttributeBytes).text.value_or("");
  while (!text.empty() && text.back() == '\n') text.pop_back();
  return text;
}

// A number of 0 or more, or nothing.
std::optional<int64_t> numberAttribute(const std::filesystem::path& device, std::string_view name) {
  const std::string text = attribute(device, name);
  const char* const end = text.data() + text.size();
  int64_t number = 0;
  const auto [rest, failure] = std::from_chars(text.data(), end, number);
  if (failure != std::errc() || rest != end || number < 0) return {};
  return number;
}

// In the order of their names, so that the same device is first every time.
std::vector<std::filesystem::path> devices(const std::filesystem::path& directory) {
  std::vector<std::filesystem::path> found;
  std::error_code failure;
  std::filesystem::directory_iterator entry(directory, failure);
  while (!failure && entry != std::filesystem::directory_iterator() &&
         found.size() < kMostDevices) {
    found.push_back(entry->path());
    entry.increment(failure);
  }
  std::ranges::sort(found);
  return found;
}

struct Power {
  std::optional<int64_t> percent = {};  // of the first battery
  bool isCharging = false;
  bool hasMains = false;
};

void addBattery(const std::filesystem::path& device, Power& power) {
  // Mice and headsets have batteries too, and say that these feed a device only.
  if (power.percent || attribute(device, "scope") == "Device") return;
  const auto capacity = numberAttribute(device, "capacity");
  if (!capacity || *capacity > kWhole) return;
  power.percent = capacity;
  power.isCharging = attribute(device, "status") == "Charging";
}

Power readPower(const std::filesystem::path& sysRoot) {
  Power power;
  for (const auto& device : devices(sysRoot / "class/power_supply")) {
    if (attribute(device, "type") == "Battery") {
      addBattery(device, power);
    } else if (numberAttribute(device, "online").value_or(0) > 0) {
      power.hasMains = true;
    }
  }
  return power;
}

std::string batteryText(const Power& power) {
  return power.percent ? percentText("Battery", *power.percent) : "No battery";
}

std::string chargerText(const Power& power) {
  if (power.isCharging) return "Charging";
  return power.percent && !power.hasMains ? "On battery" : "Mains";
}

std::string brightnessText(const std::filesystem::path& sysRoot) {
  for (const auto& device : devices(sysRoot / "class/backlight")) {
    const auto level = numberAttribute(device, "brightness");
    const auto most = numberAttribute(device, "max_brightness");
    if (!level || !most || *most == 0 || *level > *most) continue;
    const double share = static_cast<double>(*level) / static_cast<double>(*most);
    return percentText("Light", static_cast<int64_t>(share * kWhole));
  }
  return "Light n/a";
}

std::string hostNameText() {
  std::array<char, kHostNameBytes + 1> name = {};  // a name that fills it is not ended
  const bool isKnown = ::gethostname(name.data(), kHostNameBytes) == 0 && name.front() != '\0';
  return isKnown ? name.data() : "Host n/a";
}

// An interface's address as a text; empty: of another family, or for its own link only.
std::string addressOf(const ifaddrs& interface, int family) {
  if (interface.ifa_addr == nullptr || interface.ifa_addr->sa_family != family) return {};
  std::array<char, INET6_ADDRSTRLEN> text = {};
  if (family == AF_INET) {
    sockaddr_in address = {};
    std::memcpy(&address, interface.ifa_addr, sizeof address);
    ::inet_ntop(family, &address.sin_addr, text.data(), text.size());
    return text.data();
  }
  sockaddr_in6 address = {};
  std::memcpy(&address, interface.ifa_addr, sizeof address);
  if (IN6_IS_ADDR_LINKLOCAL(&address.sin6_addr)) return {};
  ::inet_ntop(family, &address.sin6_addr, text.data(), text.size());
  return text.data();
}

bool leadsOutside(const ifaddrs& interface) {
  return (interface.ifa_flags & IFF_UP) != 0 && (interface.ifa_flags & IFF_LOOPBACK) == 0;
}

std::string addressText() {
  ifaddrs* first = nullptr;
  if (::getifaddrs(&first) != 0) return "No network";
  const std::unique_ptr<ifaddrs, decltype(&::freeifaddrs)> owner(first, &::freeifaddrs);
  for (const int family : {AF_INET, AF_INET6}) {
    for (const ifaddrs* interface = first; interface != nullptr; interface = interface->ifa_next) {
      std::string text = leadsOutside(*interface) ? addressOf(*interface, family) : "";
      if (!text.empty()) return text;
    }
  }
  return "No network";
}

std::string loadText() {
  std::array<double, 3> loads = {};
  const int count = ::getloadavg(loads.data(), loads.size());
  if (std::cmp_less(count, loads.size())) return "Load n/a";
  std::string text = "Load";
  for (const double load : loads) {
    constexpr int kDecimals = 2;
    std::array<char, 64> digits = {};
    const auto [end, failure] = std::to_chars(digits.data(), digits.data() + digits.size(), load,
                                              std::chars_format::fixed, kDecimals);
    if (failure == std::errc()) text.append(" ").append(digits.data(), end);
  }
  return text;
}

}  // namespace

MachineFigures readMachineFigures(const std::filesystem::path& sysRoot) {
  const Power power = readPower(sysRoot);
  return {figure(batteryText(power)), figure(chargerText(power)), figure(brightnessText(sysRoot)),
          figure(hostNameText()),     figure(addressText()),      figure(loadText())};
}

}  // namespace factory_test
