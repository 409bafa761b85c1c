/// Figures of the machine for a menu's status texts.
#pragma once

#include <cstddef>
#include <filesystem>
#include <string>

namespace factory_test {

constexpr std::size_t kFigureLetters = 24;  // of the longest name

/// Texts in the chosen language. Names that others have chosen are 1 to kFigureLetters printable
/// ASCII characters; what is longer ends in "..".
struct MachineFigures {
  std::string battery;     // "Battery 57%", "No battery"
  std::string charger;     // "Charging", "Mains", "On battery"; "Mains" without a battery
  std::string brightness;  // "Light 63%", "Light n/a"
  std::string hostName;    // "bench7", "Host n/a"
  std::string address;     // "192.168.1.7", "No network"
  std::string load;        // over 1, 5 and 15 minutes: "Load 0.42 0.38 0.30", "Load n/a"
};

/// Reads them anew. Cheap enough for once a second on the main thread: a few small files, no name
/// service. `sysRoot` is where the kernel shows its devices; files there may hold anything. Throws
/// nothing.
MachineFigures readMachineFigures(const std::filesystem::path& sysRoot = "/sys");

}  // namespace factory_test
