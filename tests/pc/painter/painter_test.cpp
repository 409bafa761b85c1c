// What a frame shows, and what is repainted for the next one.
#include "painter/painter.h"

#include <gmock/gmock.h>

#include <array>
#include <bit>
#include <limits>
#include <random>

#include "pc/support/painting.h"

namespace brimol::pc {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr Size kScreen = {100, 60};
constexpr int32_t kLeast = std::numeric_limits<int32_t>::min();
constexpr int32_t kMost = std::numeric_limits<int32_t>::max();

TEST(Painter, LaysEveryAlphaOverEveryByteExactly) {
  Frame frame;
  for (int32_t x = 0; x < 256; ++x) {
    frame.push_back(boxItem({x, 0, 1, 1, kBlack | static_cast<uint32_t>(x) * 0x10101}));
  }
  for (uint32_t alpha = 0; alpha < 256; ++alpha) {
    const uint32_t veil = alpha << 24 | 0xFF8007;
    frame.push_back(boxItem({1, 0, 255, 1, veil}));
    const Picture picture = painted(frame, {256, 1});
    frame.pop_back();
    for (uint32_t i = 3; i < 768; ++i) {  // every byte, from the second pixel on
      const uint32_t shift = i % 3 * 8;
      const uint32_t sum = i / 3 * (255 - alpha) + (veil >> shift & 0xFF) * alpha;
      ASSERT_EQ(picture.pixels[i / 3] >> shift & 0xFF, (2 * sum + 255) / 510) << alpha << ", " << i;
    }
  }
}

TEST(Painter, RoundBoxesHaveSmoothCorners) {
  const Picture picture = painted({boxItem({10, 10, 60, 40, kWhite}, SKIA_ROUNDBOX)});
  EXPECT_EQ(picture.inked(), (Area{10, 10, 60, 40}));
  EXPECT_EQ(picture.inkIn({10, 18, 60, 24}, kWhite), 0);
  EXPECT_EQ(picture.inkIn({18, 10, 44, 40}, kWhite), 0);
  for (const auto& [x, y] :
       std::to_array<std::pair<int, int>>({{10, 10}, {62, 10}, {10, 42}, {62, 42}})) {
    const int black = 64 - picture.inkIn({x, y, 8, 8});
    EXPECT_NEAR(black, 10, 6) << x << "," << y;
    EXPECT_GT(picture.inkIn({x, y, 8, 8}, kWhite), black + 4) << "greys between";
  }
}

TEST(Painter, RowsOverAGroundLeaveItsEndsAndWhatStandsThere) {
  const Picture picture =
      painted({boxItem({0, 0, 100, 60, kWhite}), boxItem({1, 20, 3, 3, kRed}),
               boxItem({4, 10, 92, 30, kBlack}), boxItem({97, 20, 3, 3, kBlue})});
  EXPECT_EQ(picture.inkIn({4, 10, 92, 30}), 0);
  EXPECT_EQ(picture.inkIn({0, 0, 100, 60}, kWhite), 92 * 30 + 2 * 3 * 3);
  EXPECT_EQ(picture.inkIn({1, 20, 3, 3}, kRed & 0xFFFFFF), 0);
  EXPECT_EQ(picture.inkIn({97, 20, 3, 3}, kBlue & 0xFFFFFF), 0);
}

TEST(Painter, DrawsLinesInTheirWidthFromAnywhereToAnywhere) {
  const auto line = [](SKIA_Point points) { return painted({lineItem(points)}); };
  EXPECT_EQ(line({40, 30, 20, 30, kRed, 4}), painted({boxItem({20, 28, 20, 4, kRed})}));
  EXPECT_EQ(line({20, 10, 20, 40, kRed, 3}), painted({boxItem({19, 10, 3, 30, kRed})}));
  EXPECT_EQ(line({20, 10, 20, 40, kRed, -9}), painted({boxItem({20, 10, 1, 30, kRed})}));
  EXPECT_EQ(line({20, 10, 20, 10, kRed, 9}), painted({}));
  const Picture slanting = line({10, 10, 60, 50, kWhite, 8});
  EXPECT_EQ(slanting.at(35, 30), 0xFFFFFFU);
  EXPECT_EQ(slanting.at(35, 37), 0U) << "below";
  EXPECT_EQ(slanting.at(35, 22), 0U) << "above";
  EXPECT_EQ(slanting.at(5, 5), 0U) << "before its start";
  const Picture endless = line({kLeast, kLeast, kMost, kMost, kRed, 5});
  for (int i = 0; i < 60; ++i) EXPECT_EQ(endless.at(i, i), 0xFF0000U);
  EXPECT_EQ(endless.inkIn({30, 0, 70, 20}), 0);
}

TEST(Painter, ArrowsPointWhereTheirWordSays) {
  for (const int32_t direction : {0, 1, -3}) {
    const SKIA_Rect rect = {20, 10, 60, 40, 0};
    const Picture arrow = painted({{SKIA_ARROW, rect, {0, 0, 0, 0, kWhite, direction}, {}}});
    const auto at = [&](int x, int y) { return arrow.at(direction == 0 ? x : 99 - x, y); };
    EXPECT_EQ(arrow.inked(), (Area{20, 10, 60, 40}));
    EXPECT_EQ(at(22, 29), 0xFFFFFFU) << "the shaft";
    EXPECT_EQ(at(76, 30), 0xFFFFFFU) << "the tip";
    EXPECT_EQ(at(22, 15), 0U) << "above the shaft";
    EXPECT_EQ(at(76, 15), 0U) << "above the tip";
  }
}

TEST(Scene, RepaintsNoMoreThanWhatChanged) {
  const SKIA_Item label = textItem(SKIA_LABEL, {10, 10, 20, 20, kRed}, textOf("one"));
  const Frame some = {label, lineItem({10, 10, 20, 30, kRed, 2}), boxItem({5, 5, 9, 9, kBlue})};
  Frame more = some;
  more[0].rect.color = kBlue;       // a label has no ground
  more[0].text.string_len = kMost;  // and what lies behind a NUL is not drawn
  more[0].text.text[100] = 'x';
  more.insert(more.begin() + 1, boxItem({-5, 50, 10, kMost, kRed}));
  EXPECT_THAT(Changes(kScreen).between(some, more), ElementsAre(Area{0, 50, 5, 10}));
  EXPECT_THAT(Changes(kScreen).between(more, some), ElementsAre(Area{0, 50, 5, 10}));
  for (const int count : {32, 33, 900}) {
    Frame columns;
    for (int i = 0; i < count; ++i) columns.push_back(boxItem({i * 2, 0, 1, 5, kRed}));
    EXPECT_EQ(Changes({2000, 10}).between({}, columns).size(), count == 32 ? 32U : 1U);
  }
}

TEST(Painter, LeavesNothingOfATextThatReachedBeyondItsRectangle) {
  const SKIA_Item row = textItem(SKIA_TEXTBOX, {10, 28, 80, 10, kBlue}, textOf("gÄg", 30));
  const Picture shown = painted({row});
  EXPECT_GT(shown.inkIn({10, 20, 60, 8}), 0);
  EXPECT_GT(shown.inkIn({10, 38, 60, 8}), 0);
  EXPECT_EQ(shown.inkIn({80, 28, 10, 10}, kBlue), 0);
  EXPECT_EQ(shown.inkIn({80, 0, 10, 28}), 0) << "the box is not higher than its rectangle";
  Painter painter(kScreen);
  painter.paint({row});
  painter.paint({});
  EXPECT_EQ(pictureOf(painter.picture()), painted({}));
}

using Random = std::mt19937;

template <typename Row>
auto oneOf(Random& random, const Row& row) {
  return row[random() % row.size()];
}

// Words near the screen, and now and then one that is not.
int32_t anyWord(Random& random) {
  constexpr auto kWild = std::to_array<int32_t>({kLeast, -100000, -1, 0, 40000, kMost - 1, kMost});
  const int32_t near = std::uniform_int_distribution(-30, 110)(random);
  return random() % 16 == 0 ? oneOf(random, kWild) : near;
}

SKIA_Item anyItem(Random& random) {
  constexpr auto kColors = std::to_array<uint32_t>({kRed, kBlue, kWhite, 0x80FFC010, 0x13FF00FF});
  constexpr auto kTexts =
      std::to_array<const char*>({"", "Test", "two\nlines", "한국어", "עברית", "\xE4\xFF",
                                  "long enough to be cut at its edge"});
  const auto word = [&] { return anyWord(random); };
  const auto color = [&] { return oneOf(random, kColors); };
  SKIA_Item item = {static_cast<int32_t>(random() % (SKIA_ARROW + 3)) - 1,
                    {word(), word(), word(), word(), color()},
                    {word(), word(), word(), word(), color(), word() / 9},
                    textOf(oneOf(random, kTexts), word() / 3, color(), word() % 6)};
  if (random() % 8 == 0) item.text.string_len = word();
  return item;
}

// One word of the item changed.
void changeWord(SKIA_Item& item, Random& random) {
  auto words = std::bit_cast<std::array<int32_t, sizeof item / sizeof(int32_t)>>(item);
  words.at(random() % 2 == 0 ? random() % 15 : words.size() - 1 - random() % 4) = anyWord(random);
  item = std::bit_cast<SKIA_Item>(words);
}

TEST(Painter, PaintingByPartsEqualsPaintingAtOnceWhateverTheRecords) {
  Random random(2024);
  Painter painter(kScreen);
  Painter whole(kScreen);
  Frame frame;
  for (int round = 0; round < 1000; ++round) {
    if (round % 2 == 0) {
      const auto place = static_cast<std::ptrdiff_t>(random() % (frame.size() + 1));
      frame.insert(frame.begin() + place, anyItem(random));
    }
    if (frame.size() > 8) frame.erase(frame.begin(), frame.begin() + 3);
    changeWord(frame.at(random() % frame.size()), random);
    painter.paint(frame);
    whole.paint({boxItem({0, 0, 100, 60, 0xFF010203})});
    ASSERT_THAT(whole.paint(frame), ElementsAre(Area{0, 0, 100, 60}));
    ASSERT_EQ(pictureOf(painter.picture()), pictureOf(whole.picture())) << "round " << round;
  }
  EXPECT_THAT(painter.paint(frame), IsEmpty());
  EXPECT_THAT(Painter({0, 0}).paint(frame), IsEmpty());
}

}  // namespace
}  // namespace brimol::pc
