#include "painter.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <array>
#include <limits>
#include <random>

#include "painting.h"

namespace brimol::pc {
namespace {

using Area = cairo_rectangle_int_t;

constexpr int32_t kLeast = std::numeric_limits<int32_t>::min();
constexpr int32_t kMost = std::numeric_limits<int32_t>::max();
constexpr uint32_t kGreenRgb = 0x0000FF00;

// A colour laid over another, channel by channel, rounded to the nearest.
uint32_t laidOver(uint32_t below, uint32_t color) {
  const uint32_t alpha = color >> 24;
  uint32_t result = 0;
  for (const int shift : {0, 8, 16}) {
    const uint32_t sum = (below >> shift & 0xFF) * (255 - alpha) + (color >> shift & 0xFF) * alpha;
    result |= (2 * sum + 255) / 510 << shift;
  }
  return result;
}

TEST(PainterTest, StartsBlackAndFillsBoxesToTheirEdges) {
  const Picture picture = painted({boxItem({10, 20, 30, 5, 0xFF123456})});
  EXPECT_EQ(picture.inked(), (Area{10, 20, 30, 5}));
  EXPECT_EQ(picture.inkIn({10, 20, 30, 5}, 0xFF123456), 0);
}

TEST(PainterTest, CutsBoxesAtTheScreen) {
  EXPECT_EQ(painted({boxItem({-7, -8, 10, 10, kRed})}).inked(), (Area{0, 0, 3, 2}));
  EXPECT_EQ(painted({boxItem({95, 57, kMost, kMost, kRed})}).inked(), (Area{95, 57, 5, 3}));
  EXPECT_EQ(painted({boxItem({5, 5, 0, 10, kRed}), boxItem({5, 5, 10, -1, kRed})}), painted({}));
}

TEST(PainterTest, LaysEveryAlphaOverEveryByteExactly) {
  constexpr Size kRamp = {256, 3};
  for (uint32_t alpha = 0; alpha < 256; ++alpha) {
    Frame frame;
    for (int32_t x = 0; x < kRamp.w; ++x) {
      const auto byte = static_cast<uint32_t>(x);
      frame.push_back(boxItem({x, 0, 1, 3, 0xFF000000 | byte << 16 | byte << 8 | byte}));
    }
    const uint32_t veil = alpha << 24 | 0x00FF8007;
    frame.push_back(boxItem({0, 0, kRamp.w, 3, veil}));
    const Picture picture = painted(frame, kRamp);
    for (uint32_t byte = 0; byte < 256; ++byte) {
      const uint32_t below = byte << 16 | byte << 8 | byte;
      ASSERT_EQ(picture.at(static_cast<int>(byte), 1), laidOver(below, veil))
          << "alpha " << alpha << " over " << byte;
    }
  }
}

TEST(PainterTest, AVeilOfAnyWidthEqualsItsColumns) {
  const SKIA_Item ground = boxItem({0, 0, 100, 60, 0xFF345678});
  Frame columns = {ground};
  for (int32_t x = 3; x < 40; ++x) columns.push_back(boxItem({x, 5, 1, 20, 0x70F08040}));
  EXPECT_EQ(painted({ground, boxItem({3, 5, 37, 20, 0x70F08040})}), painted(columns));
}

TEST(PainterTest, RoundBoxesHaveSmoothSymmetricCorners) {
  const Picture picture = painted({boxItem({10, 10, 60, 40, kWhite}, SKIA_ROUNDBOX)});
  EXPECT_EQ(picture.inked(), (Area{10, 10, 60, 40}));
  EXPECT_EQ(picture.at(10, 10), 0U);
  EXPECT_EQ(picture.inkIn({10, 20, 60, 20}, kWhite), 0);
  EXPECT_EQ(picture.inkIn({20, 10, 40, 40}, kWhite), 0);
  int greys = 0;
  for (int y = 10; y < 20; ++y) {
    for (int x = 10; x < 20; ++x) {
      const uint32_t pixel = picture.at(x, y);
      greys += pixel != 0 && pixel != 0xFFFFFF ? 1 : 0;
      EXPECT_EQ(picture.at(79 - x, y), pixel);
      EXPECT_EQ(picture.at(x, 59 - y), pixel);
      EXPECT_EQ(picture.at(y, x), pixel);
    }
  }
  EXPECT_GT(greys, 6);
}

TEST(PainterTest, LevelAndUprightLinesAreCrisp) {
  EXPECT_EQ(painted({lineItem({40, 30, 20, 30, kRed, 4})}),
            painted({boxItem({20, 28, 20, 4, kRed})}));
  EXPECT_EQ(painted({lineItem({20, 10, 20, 40, kRed, 3})}),
            painted({boxItem({19, 10, 3, 30, kRed})}));
  EXPECT_EQ(painted({lineItem({20, 10, 20, 40, kRed, -9})}),
            painted({boxItem({20, 10, 1, 30, kRed})}));
  EXPECT_EQ(painted({lineItem({20, 10, 20, 10, kRed, 9})}), painted({}));
}

TEST(PainterTest, SlantedLinesHaveTheirWidthAndPlace) {
  const Picture picture = painted({lineItem({10, 10, 60, 50, kWhite, 8})});
  EXPECT_EQ(picture.at(35, 30), 0xFFFFFFU);
  EXPECT_EQ(picture.at(35, 38), 0U);
  EXPECT_EQ(picture.at(35, 22), 0U);
  EXPECT_EQ(picture.at(5, 5), 0U);
  EXPECT_EQ(painted({lineItem({60, 50, 10, 10, kWhite, 8})}), picture);
}

TEST(PainterTest, ALineFarBeyondTheScreenCrossesIt) {
  const Picture picture = painted({lineItem({kLeast, kLeast, kMost, kMost, kRed, 5})});
  for (int i = 0; i < 60; ++i) EXPECT_EQ(picture.at(i, i), 0xFF0000U);
  EXPECT_EQ(picture.inkIn({30, 0, 70, 20}), 0);
}

TEST(PainterTest, ArrowsPointWhereTheirWordSays) {
  const SKIA_Rect rect = {20, 10, 60, 40, 0};
  const Picture right = painted({arrowItem(rect, kGreenRgb | kBlack, 0)});
  const Picture left = painted({arrowItem(rect, kGreenRgb | kBlack, -3)});
  EXPECT_EQ(right.inked(), (Area{20, 10, 60, 40}));
  EXPECT_EQ(left.inked(), right.inked());
  // Mirrored, but for the rounding at the edges.
  constexpr int kRounding = 0x1000;
  for (int y = 10; y < 50; ++y) {
    for (int x = 20; x < 80; ++x) {
      const int mirrored = static_cast<int>(right.at(99 - x, y));
      ASSERT_NEAR(static_cast<int>(left.at(x, y)), mirrored, kRounding) << x << "," << y;
    }
  }
  EXPECT_EQ(right.at(22, 29), kGreenRgb) << "the shaft";
  EXPECT_EQ(right.at(22, 15), 0U) << "above the shaft";
  EXPECT_EQ(right.at(76, 30), kGreenRgb) << "the tip";
  EXPECT_EQ(right.at(76, 15), 0U) << "above the tip";
}

TEST(PainterTest, ReturnsAndRepaintsWhatChanged) {
  Painter painter({100, 60});
  const Frame frame = {boxItem({0, 0, 100, 60, kBlue}), boxItem({10, 10, 20, 20, kRed})};
  Frame next = frame;
  next[1].rect.color = 0x80FF0000;
  EXPECT_THAT(painter.paint(frame), testing::ElementsAre(Area{0, 0, 100, 60}));
  EXPECT_THAT(painter.paint(frame), testing::IsEmpty());
  EXPECT_THAT(painter.paint(next), testing::ElementsAre(Area{10, 10, 20, 20}));
  EXPECT_EQ(pictureOf(painter.picture()), painted(next));
  EXPECT_THAT(painter.paint({}), testing::ElementsAre(Area{0, 0, 100, 60}));
  EXPECT_EQ(pictureOf(painter.picture()), painted({}));
}

// Frames of every kind of item, made from a seed.
class FrameMaker {
 public:
  explicit FrameMaker(unsigned int seed) : random(seed) {}

  Frame frame() {
    Frame made(static_cast<std::size_t>(number(0, 12)));
    std::ranges::generate(made, [this] { return item(); });
    return made;
  }

  // A few items of the frame changed, added or removed.
  Frame variant(Frame frame) {
    for (int32_t changes = number(1, 3); changes > 0; --changes) {
      const auto place = frame.begin() + number(0, static_cast<int32_t>(frame.size()));
      const int32_t what = number(0, 2);
      if (what == 0) frame.insert(place, item());
      if (what == 1 && place != frame.end()) frame.erase(place);
      if (what == 2 && place != frame.end()) *place = item();
    }
    return frame;
  }

  int32_t number(int32_t least, int32_t most) {
    return std::uniform_int_distribution<int32_t>(least, most)(random);
  }

 private:
  uint32_t color() {
    constexpr auto kAlphas = std::to_array<uint32_t>({0xFF, 0xFF, 0x80, 0x13, 0});
    const uint32_t alpha = kAlphas.at(static_cast<std::size_t>(number(0, 4)));
    return alpha << 24 | static_cast<uint32_t>(number(0, 0xFFFFFF));
  }

  SKIA_Rect rect() {
    return {number(-20, 90), number(-20, 55), number(-5, 110), number(-5, 70), color()};
  }

  SKIA_Item item() {
    constexpr auto kWords = std::to_array<const char*>(
        {"", "Test", "two\nlines", "한국어", "עברית", "long enough to be cut at its rectangle"});
    SKIA_Item item = {number(SKIA_LABEL, SKIA_ARROW), rect(), {}, {}};
    item.point = {number(-30, 130), number(-30, 90), number(-30, 130),
                  number(-30, 90),  color(),         number(0, 9)};
    item.text = textOf(kWords.at(static_cast<std::size_t>(number(0, 5))), number(0, 40), color(),
                       number(0, 5));
    return item;
  }

  std::mt19937 random;
};

TEST(PainterTest, PaintingByPartsEqualsPaintingAtOnce) {
  FrameMaker maker(2024);
  Painter painter({100, 60});
  Painter whole({100, 60});
  const Frame cover = {boxItem({0, 0, 100, 60, 0xFF010203})};
  Frame frame;
  for (int round = 0; round < 400; ++round) {
    frame = round % 10 == 0 ? maker.frame() : maker.variant(frame);
    painter.paint(frame);
    whole.paint(cover);
    ASSERT_THAT(whole.paint(frame), testing::ElementsAre(Area{0, 0, 100, 60}));
    ASSERT_EQ(pictureOf(painter.picture()), pictureOf(whole.picture())) << "round " << round;
  }
}

TEST(PainterTest, NoRecordDoesHarm) {
  constexpr auto kWords =
      std::to_array<int32_t>({kLeast, kLeast + 1, -100000, -1, 0, 1, 30, 40000, kMost - 1, kMost});
  FrameMaker maker(7);
  const auto word = [&maker, &kWords] {
    return kWords.at(static_cast<std::size_t>(maker.number(0, kWords.size() - 1)));
  };
  Painter painter({100, 60});
  Frame frame;
  for (int i = 0; i < 600; ++i) {
    SKIA_Item item = {maker.number(-1, SKIA_ARROW + 1), {}, {}, {}};
    item.rect = {word(), word(), word(), word(), 0x80FF0000};
    item.point = {word(), word(), word(), word(), 0x8000FF00, word()};
    std::ranges::fill(item.text.text, i % 3 == 0 ? '\xE4' : 'x');
    item.text.string_len = word();
    item.text.size = word();
    item.text.align = word();
    item.text.color = kWhite;
    frame = {boxItem({0, 0, 100, 60, kBlue}), item, boxItem({0, 0, 3, 3, kGreenRgb | kBlack})};
    painter.paint(frame);
    ASSERT_EQ(pictureOf(painter.picture()).at(1, 1), kGreenRgb);
  }
  EXPECT_EQ(pictureOf(painter.picture()), painted(frame));
}

TEST(PainterTest, AScreenWithoutSizeShowsNothing) {
  Painter painter({0, 0});
  EXPECT_THAT(painter.paint({boxItem({0, 0, 9, 9, kRed})}), testing::IsEmpty());
}

}  // namespace
}  // namespace brimol::pc
