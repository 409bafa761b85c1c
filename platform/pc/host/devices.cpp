#include "host/devices.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace brimol::pc {

namespace {

// The oldest first. The density is the diagonal in pixels by the diagonal in inches.
constexpr auto kDevices = std::to_array<BrimolDevice>({
    {"hvga-3.2", "small and coarse", 320, 480, 180.3f, 2009},
    {"wvga-4.0", "mid-range of the first touch years", 480, 800, 233.2f, 2011},
    {"hd-4.7", "compact", 720, 1280, 312.5f, 2013},
    {"fhd-5.0", "sharp and handy", 1080, 1920, 440.6f, 2014},
    {"wqhd-5.5", "very fine", 1440, 2560, 534.0f, 2016},
    {"hdplus-6.5", "long and coarse, low-priced", 720, 1600, 269.9f, 2020},
    {"fhdplus-6.5", "long, the most common", 1080, 2400, 404.9f, 2021},
    {"wqhdplus-6.8", "long and very fine", 1440, 3088, 501.1f, 2022},
});
static_assert(std::ranges::is_sorted(kDevices, {}, &BrimolDevice::year));

}  // namespace

std::span<const BrimolDevice> devices() { return kDevices; }

std::string namesOfDevices() {
  std::string names = kDevices.front().name;
  for (std::size_t i = 1; i < kDevices.size(); ++i) {
    names.append(i + 1 < kDevices.size() ? ", " : " or ").append(kDevices[i].name);
  }
  return names;
}

}  // namespace brimol::pc

const BrimolDevice* brimol_devices(int* count) {
  if (count != nullptr) *count = static_cast<int>(brimol::pc::kDevices.size());
  return brimol::pc::kDevices.data();
}

const BrimolDevice* brimol_device_named(const char* name) {
  if (name == nullptr) return nullptr;
  const auto* const device =
      std::ranges::find(brimol::pc::kDevices, name,
                        [](const BrimolDevice& each) { return std::string_view(each.name); });
  return device == brimol::pc::kDevices.end() ? nullptr : device;
}
