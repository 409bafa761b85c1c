// The small parts that widgets share.

#include <MW/detail/click_slop.h>
#include <MW/detail/key_clicks.h>
#include <MW/detail/star_row.h>
#include <gtest/gtest.h>

#include <climits>
#include <string>

namespace {

using MW::ClickSlop;
using MW::KeyClicks;
using MW::StarRow;

TEST(StarRowTest, StepsAfterMoreThanATenthOfASecond) {
  StarRow row;
  row.restart(1000);
  EXPECT_FALSE(row.step(1100));
  EXPECT_TRUE(row.step(1101));
  EXPECT_FALSE(row.step(1101));
  row.delay(1150);
  EXPECT_FALSE(row.step(1250));
  EXPECT_TRUE(row.step(1251));
  EXPECT_EQ(row.count(), 2U);
  row.restart(5000);
  EXPECT_EQ(row.count(), 0U);
  EXPECT_TRUE(row.step(1300)) << "a start in the future is long ago";
}

TEST(StarRowTest, StepsAcrossTheWrap) {
  StarRow row;
  row.restart(0xFFFFFFF0);
  EXPECT_FALSE(row.step(84));
  EXPECT_TRUE(row.step(85));
}

TEST(StarRowTest, TextStaysWithinItsRecord) {
  SKIA_Text record = {};
  record.size = 7;
  const auto stars = [&record](uint32_t count) {
    MW::putStars(record, count);
    EXPECT_EQ(record.text[record.string_len], '\0');
    return std::string(record.text);
  };
  EXPECT_EQ(stars(UINT_MAX), std::string(127, '*'));
  EXPECT_EQ(stars(10), "**********");
  EXPECT_EQ(stars(0), "*");
  EXPECT_EQ(record.size, 7);
}

TEST(KeyClicksTest, CountsTheKeyThatItFollows) {
  KeyClicks clicks;
  EXPECT_EQ(clicks.click(5, 1000), 0) << "nothing is followed";
  clicks.follow({1, 5}, 1000);
  EXPECT_EQ(clicks.click(5, 1000), 1);
  EXPECT_EQ(clicks.click(5, 1999), 2);
  EXPECT_EQ(clicks.click(5, 2999), 1) << "too late";
  EXPECT_EQ(clicks.click(6, 3000), 0);
  EXPECT_EQ(clicks.lastKey.code, 65535U);
}

TEST(ClickSlopTest, GivesUpBeyondTheSlop) {
  for (const int sign : {1, -1}) {
    ClickSlop click;
    EXPECT_EQ(click.row(), ClickSlop::kNone);
    click.press(3);
    click.move(sign * 20, sign * 28, 28);
    click.move(sign * 8, 0, 28);
    EXPECT_EQ(click.row(), 3);
    click.move(sign, 0, 28);
    EXPECT_EQ(click.row(), ClickSlop::kNone);
    click.move(-sign * 29, 0, 28);
    EXPECT_EQ(click.row(), ClickSlop::kNone) << "for good";
    click.press(4);
    click.move(0, sign * 28, 28);
    EXPECT_EQ(click.row(), 4) << "from nothing";
  }
}

TEST(ClickSlopTest, TakesAnyMotion) {
  ClickSlop click;
  click.press(1);
  for (int i = 0; i < 4; ++i) click.move(INT_MIN, INT_MAX, INT_MAX);
  EXPECT_EQ(click.row(), ClickSlop::kNone);
  click.press(1);
  click.move(0, 0, -1);
  EXPECT_EQ(click.row(), ClickSlop::kNone);
}

}  // namespace
