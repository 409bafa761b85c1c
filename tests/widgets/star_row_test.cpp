#include <MW/detail/star_row.h>

#include <array>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

// The steps that a row has taken after each of these ticks.
template <std::size_t size>
constexpr std::array<uint32_t, size> countsAfter(MW::StarRow row,
                                                 std::array<uint32_t, size> ticks) {
  for (uint32_t& tick : ticks) {
    row.step(tick);
    tick = row.count();
  }
  return ticks;
}
constexpr MW::StarRow startedAt(uint32_t tick) {
  MW::StarRow row;
  row.restart(tick);
  return row;
}
static_assert(countsAfter(startedAt(1000), std::array{1100U, 1101U, 1201U, 1202U}) ==
              std::array{0U, 1U, 1U, 2U});
static_assert(countsAfter(startedAt(2000), std::array{1000U, 1100U, 1101U}) ==
              std::array{1U, 1U, 2U});  // a start in the future
static_assert(countsAfter(startedAt(~49U), std::array{50U, 51U, 151U}) == std::array{0U, 1U, 1U});

constexpr MW::StarRow delayedTo(MW::StarRow row, uint32_t tick) {
  row.delay(tick);
  return row;
}
static_assert(!delayedTo(startedAt(1000), 1101).isDue(1201));
static_assert(delayedTo(startedAt(1000), 1101).isDue(1202));

TEST(StarRow, ATextHasAtLeastOneStarAndAtMostWhatItsRecordHolds) {
  const std::vector<std::pair<uint32_t, std::size_t>> lengths = {
      {0, 1}, {1, 1}, {9, 9}, {127, 127}, {128, 127}, {~0U, 127}};
  for (const auto& [stars, length] : lengths) {
    SKIA_Text record = {};
    MW::putStars(record, stars);
    EXPECT_EQ(std::string(record.text), std::string(length, '*'));
    EXPECT_EQ(record.string_len, static_cast<int>(length));
  }
}

}  // namespace
