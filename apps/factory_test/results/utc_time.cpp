#include "results/utc_time.h"

#include <array>
#include <ctime>

namespace factory_test {

namespace {

constexpr const char* kPattern = "%Y-%m-%dT%H:%M:%SZ";
constexpr std::size_t kMostBytes = 64;

}  // namespace

std::string utcText(std::chrono::sys_seconds time) {
  const std::time_t seconds = time.time_since_epoch().count();
  std::tm parts = {};
  ::gmtime_r(&seconds, &parts);
  std::array<char, kMostBytes> text = {};
  const std::size_t length = std::strftime(text.data(), text.size(), kPattern, &parts);
  return {text.data(), length};
}

std::optional<std::chrono::sys_seconds> parseUtc(const std::string& text) {
  std::tm parts = {};
  if (::strptime(text.c_str(), kPattern, &parts) == nullptr) return {};
  const std::chrono::sys_seconds time(std::chrono::seconds(::timegm(&parts)));
  // The system also reads days that do not exist, signs, blanks and short numbers.
  if (utcText(time) != text) return {};
  return time;
}

}  // namespace factory_test
