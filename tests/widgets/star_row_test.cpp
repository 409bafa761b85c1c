#include <MW/detail/star_row.h>

#include <initializer_list>

#include "support/widget_test.h"

namespace {

// The steps after each of these ticks, as digits.
constexpr uint32_t counts(uint32_t start, std::initializer_list<uint32_t> ticks) {
  MW::StarRow row;
  row.restart(start);
  uint32_t digits = 0;
  for (const uint32_t now : ticks) {
    row.step(now);
    digits = digits * 10 + row.count();
  }
  return digits;
}
static_assert(counts(1000, {1100, 1101, 1201, 1202}) == 112);
static_assert(counts(0, {100, 101, 201, 202}) == 112);
static_assert(counts(2000, {1000, 1100, 1101}) == 112);  // a start in the future
static_assert(counts(~49U, {50, 51, 151, 152}) == 112);  // over the wrap

constexpr bool isDueAfterDelay(uint32_t delayedTo, uint32_t now) {
  MW::StarRow row;
  row.delay(delayedTo);
  return row.isDue(now);
}
static_assert(!isDueAfterDelay(1101, 1201) && isDueAfterDelay(1101, 1202));

TEST(StarRow, TextsHaveAtLeastOneStarAndAtMostWhatTheirRecordHolds) {
  for (const auto& [stars, length] : {std::pair(0U, 1), {1, 1}, {127, 127}, {~0U, 127}}) {
    SKIA_Text record = {};
    MW::putStars(record, stars);
    EXPECT_EQ(record.text, std::string(static_cast<std::size_t>(length), '*'));
    EXPECT_EQ(record.string_len, length);
  }
}

}  // namespace
