#include "results/utc_time.h"

#include <algorithm>
#include <charconv>
#include <cstddef>
#include <cstdint>

namespace factory_test {

namespace {

using namespace std::chrono_literals;

constexpr std::string_view kPattern = "0000-00-00T00:00:00Z";

// Where a number stands in the pattern.
struct Place {
  std::size_t at;
  std::size_t digits;
};
constexpr Place kYear = {0, 4};
constexpr Place kMonth = {5, 2};
constexpr Place kDay = {8, 2};
constexpr Place kHour = {11, 2};
constexpr Place kMinute = {14, 2};
constexpr Place kSecond = {17, 2};

constexpr int kBase = 10;

void put(std::string& text, Place place, int64_t number) {
  for (std::size_t i = place.digits; i-- > 0; number /= kBase) {
    text[place.at + i] = static_cast<char>('0' + number % kBase);
  }
}

bool isDigit(char letter) { return letter >= '0' && letter <= '9'; }

bool hasPattern(std::string_view text) {
  return std::ranges::equal(text, kPattern, [](char letter, char wanted) {
    return isDigit(wanted) ? isDigit(letter) : letter == wanted;
  });
}

int numberAt(std::string_view text, Place place) {
  const std::string_view digits = text.substr(place.at, place.digits);
  int number = 0;
  std::from_chars(digits.data(), digits.data() + digits.size(), number);
  return number;
}

}  // namespace

std::string utcText(std::chrono::sys_seconds time) {
  time = std::clamp(time, kFirstSecond, kLastSecond);
  const auto midnight = std::chrono::floor<std::chrono::days>(time);
  const std::chrono::year_month_day date(midnight);
  const std::chrono::hh_mm_ss clock(time - midnight);
  std::string text(kPattern);
  put(text, kYear, int{date.year()});
  put(text, kMonth, unsigned{date.month()});
  put(text, kDay, unsigned{date.day()});
  put(text, kHour, clock.hours().count());
  put(text, kMinute, clock.minutes().count());
  put(text, kSecond, clock.seconds().count());
  return text;
}

std::optional<std::chrono::sys_seconds> parseUtc(std::string_view text) {
  if (!hasPattern(text)) return {};
  const std::chrono::year_month_day date(
      std::chrono::year(numberAt(text, kYear)),
      std::chrono::month(static_cast<unsigned>(numberAt(text, kMonth))),
      std::chrono::day(static_cast<unsigned>(numberAt(text, kDay))));
  const std::chrono::hours hour(numberAt(text, kHour));
  const std::chrono::minutes minute(numberAt(text, kMinute));
  const std::chrono::seconds second(numberAt(text, kSecond));
  if (!date.ok() || hour >= 24h || minute >= 1h || second >= 1min) return {};
  return std::chrono::sys_days(date) + hour + minute + second;
}

}  // namespace factory_test
