#include "machine_figures.h"

#include <ifaddrs.h>
#include <net/if.h>
#include <netdb.h>
#include <netinet/in.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdint>
#include <cstdlib>
#include <iomanip>
#include <memory>
#include <set>
#include <sstream>
#include <string_view>
#include <system_error>
#include <utility>

#include "language/language.h"
#include "results/whole_file.h"

namespace factory_test {

namespace fs = std::filesystem;

namespace {

constexpr std::size_t kHostNameBytes = 256;
constexpr std::size_t kAddressBytes = 64;
constexpr int kWhole = 100;  // percent
constexpr int kLoadDecimals = 2;
constexpr std::string_view kCut = "..";

// What others have chosen, as it can be shown.
std::string shown(std::string name) {
  std::ranges::replace_if(
      name, [](char letter) { return letter < ' ' || letter > '~'; }, '?');
  if (name.size() <= kFigureLetters) return name;
  return name.substr(0, kFigureLetters - kCut.size()).append(kCut);
}

std::string percentText(const char* name, int64_t percent) {
  return name + std::to_string(percent) + "%";
}

// The first line of a device's attribute; empty: it has none.
std::string attribute(const fs::path& device, const char* name) {
  std::string error;
  const std::string text = readFile(device / name, error).value_or("");
  return text.substr(0, text.find('\n'));
}

// Negative: it has no such number.
int numberAttribute(const fs::path& device, const char* name) {
  const std::string text = attribute(device, name);
  const char* const end = text.data() + text.size();
  int number = 0;
  const auto [rest, failure] = std::from_chars(text.data(), end, number);
  return failure == std::errc() && rest == end ? number : -1;
}

// By their names, so that the same device is first every time.
std::set<fs::path> devices(const fs::path& directory) {
  std::set<fs::path> found;
  std::error_code failure;
  fs::directory_iterator entry(directory, failure);
  for (; !failure && entry != fs::directory_iterator(); entry.increment(failure)) {
    found.insert(entry->path());
  }
  return found;
}

std::string chargerText(std::string_view status) {
  if (status == "Discharging") return tr("On battery");
  return status == "Charging" ? tr("Charging") : tr("Mains");
}

struct Power {
  std::string battery = tr("No battery");
  std::string charger = tr("Mains");
};

Power readPower(const fs::path& sysRoot) {
  for (const auto& device : devices(sysRoot / "class/power_supply")) {
    const int percent = numberAttribute(device, "capacity");
    // Mice and headsets have batteries too, and say that these feed a device only.
    if (percent < 0 || attribute(device, "scope") == "Device") continue;
    return {percentText(tr("Battery "), percent), chargerText(attribute(device, "status"))};
  }
  return {};
}

std::string brightnessText(const fs::path& sysRoot) {
  for (const auto& device : devices(sysRoot / "class/backlight")) {
    const int level = numberAttribute(device, "brightness");
    const int most = numberAttribute(device, "max_brightness");
    if (level < 0 || most <= 0) continue;
    return percentText(tr("Light "), int64_t{level} * kWhole / most);
  }
  return tr("Light n/a");
}

std::string hostNameText() {
  std::array<char, kHostNameBytes + 1> name = {};  // a name that fills it is not ended
  return ::gethostname(name.data(), kHostNameBytes) == 0 ? shown(name.data()) : tr("Host n/a");
}

bool leadsOutside(const ifaddrs& interface) {
  return (interface.ifa_flags & IFF_UP) != 0 && (interface.ifa_flags & IFF_LOOPBACK) == 0 &&
         interface.ifa_addr != nullptr && interface.ifa_addr->sa_family == AF_INET;
}

std::string addressText() {
  ifaddrs* first = nullptr;
  if (::getifaddrs(&first) != 0) return tr("No network");
  const std::unique_ptr<ifaddrs, decltype(&::freeifaddrs)> owner(first, &::freeifaddrs);
  while (first != nullptr && !leadsOutside(*first)) first = first->ifa_next;
  std::array<char, kAddressBytes> text = {};
  const bool isKnown =
      first != nullptr && ::getnameinfo(first->ifa_addr, sizeof(sockaddr_in), text.data(),
                                        text.size(), nullptr, 0, NI_NUMERICHOST) == 0;
  return isKnown ? text.data() : tr("No network");
}

std::string loadText() {
  std::array<double, 3> loads = {};
  if (std::cmp_less(::getloadavg(loads.data(), loads.size()), loads.size())) return tr("Load n/a");
  std::ostringstream text;
  text << std::fixed << std::setprecision(kLoadDecimals) << tr("Load");
  for (const double load : loads) text << ' ' << load;
  return text.str();
}

}  // namespace

MachineFigures readMachineFigures(const fs::path& sysRoot) {
  const auto [battery, charger] = readPower(sysRoot);
  return {battery, charger, brightnessText(sysRoot), hostNameText(), addressText(), loadText()};
}

}  // namespace factory_test
