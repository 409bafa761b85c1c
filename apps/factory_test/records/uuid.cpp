#include "records/uuid.h"

#include <sys/random.h>

#include <array>
#include <cstdint>

namespace factory_test {

std::string newUuid() {
  constexpr std::string_view kDigits = "0123456789abcdef";
  std::array<std::uint8_t, 16> bytes = {};
  // So few bytes come at once and whole, once the system has started.
  while (::getrandom(bytes.data(), bytes.size(), 0) != static_cast<ssize_t>(bytes.size())) continue;
  bytes[6] = static_cast<std::uint8_t>((bytes[6] & 0x0fU) | 0x40U);  // version
  bytes[8] = static_cast<std::uint8_t>((bytes[8] & 0x3fU) | 0x80U);  // variant
  std::string text;
  for (const std::uint8_t byte : bytes) {
    if (text.size() == 8 || text.size() == 13 || text.size() == 18 || text.size() == 23)
      text += '-';
    text += kDigits[byte >> 4U];
    text += kDigits[byte & 0x0fU];
  }
  return text;
}

}  // namespace factory_test
