#include "painter/text_painter.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <span>
#include <string>

#include "painting.h"

namespace brimol::pc {
namespace {

using Area = cairo_rectangle_int_t;

constexpr SKIA_Rect kWide = {20, 10, 400, 80, 0};
constexpr Area kWideArea = {20, 10, 400, 80};
constexpr Size kScreen = {440, 100};

class TextPainterTest : public testing::Test {
 protected:
  // What a canvas shows of the text in `rect`, of which no more than `clip` is painted.
  Picture drawn(const SKIA_Text& text, SKIA_Rect rect = kWide, Area clip = kWideArea) {
    const Canvas canvas(kScreen);
    painter.draw(canvas, rect, text, clip);
    return pictureOf(canvas.surface());
  }

  Area inkOf(const SKIA_Text& text) { return drawn(text).inked(); }

  TextPainter painter = TextPainter(projectFontFiles());
};

TEST_F(TextPainterTest, AlignsLeftRightAndCentred) {
  const Area left = inkOf(textOf("Hill", 40, kWhite, 1));
  const Area right = inkOf(textOf("Hill", 40, kWhite, 2));
  const Area centred = inkOf(textOf("Hill", 40, kWhite, 5));
  EXPECT_NEAR(left.x, 20, 8);
  EXPECT_NEAR(right.x + right.width, 420, 8);
  EXPECT_NEAR(2 * centred.x + centred.width, 440, 8);
  EXPECT_EQ(left.width, right.width);
  for (const int32_t other : {0, 3, 4, 6, -1}) {
    EXPECT_EQ(inkOf(textOf("Hill", 40, kWhite, other)), left) << other;
  }
}

TEST_F(TextPainterTest, SizeIsInPixelsAndCentredInHeight) {
  // A capital of the font is 0.711 of the size high.
  for (const int size : {20, 40, 60}) {
    const Area ink = inkOf(textOf("H", size));
    EXPECT_NEAR(ink.height, 0.711 * size, 1.5) << size;
    EXPECT_NEAR(2 * ink.y + ink.height, 100, size / 5.0 + 2) << size;
  }
}

TEST_F(TextPainterTest, CutsAtTheRectangle) {
  const SKIA_Text text = textOf("wide words that do not fit", 60, kWhite, 5);
  const Picture whole = drawn(text);
  EXPECT_GT(whole.inked().width, 390);
  EXPECT_EQ(whole.inkIn({0, 0, 20, 100}) + whole.inkIn({420, 0, 20, 100}), 0);
  const Picture part = drawn(text, kWide, {100, 30, 37, 21});
  for (int y = 30; y < 51; ++y) {
    for (int x = 100; x < 137; ++x) ASSERT_EQ(part.at(x, y), whole.at(x, y)) << x << "," << y;
  }
  EXPECT_EQ(part.inkIn({0, 0, 440, 100}), part.inkIn({100, 30, 37, 21}));
}

TEST_F(TextPainterTest, EachLineIsAligned) {
  const Picture picture = drawn(textOf("i\nwide words", 30, kWhite, 2));
  EXPECT_GT(picture.inkIn({410, 15, 10, 35}), 0) << "the short line stands at the right edge";
  EXPECT_EQ(picture.inkIn({20, 15, 380, 30}), 0) << "and nowhere else";
  EXPECT_GT(picture.inkIn({20, 50, 400, 40}), 100) << "above the long one";
}

TEST_F(TextPainterTest, TakesColourAndAlphaFromTheRecord) {
  const auto pixelsOf = [this](uint32_t color) {
    return drawn(textOf("████", 60, color)).at(60, 50);
  };
  EXPECT_EQ(pixelsOf(0xFF123456), 0x123456U);
  EXPECT_EQ(pixelsOf(0x80FFFFFF), 0x808080U);
  EXPECT_EQ(pixelsOf(0x00FFFFFF), 0U);
}

TEST_F(TextPainterTest, ReadsNoMoreThanItsBytes) {
  SKIA_Text text = textOf("HillHill", 40);
  const Picture whole = drawn(text);
  text.string_len = 4;
  EXPECT_EQ(drawn(text), drawn(textOf("Hill", 40)));
  text.string_len = 1'000'000;
  EXPECT_EQ(drawn(text), whole);
  text.string_len = -5;
  EXPECT_EQ(drawn(text), drawn(textOf("", 40)));
  std::ranges::fill(text.text, 'i');
  text.string_len = std::numeric_limits<int32_t>::max();
  EXPECT_EQ(drawn(text), drawn(textOf(std::string(127, 'i'), 40)));
}

TEST_F(TextPainterTest, BytesThatAreNoCharacterShowAsReplacement) {
  EXPECT_EQ(drawn(textOf("a\xFF z", 40)), drawn(textOf("a\uFFFD z", 40)));
  EXPECT_EQ(drawn(textOf("a\xE4\xB8", 40)), drawn(textOf("a\uFFFD\uFFFD", 40)));
  EXPECT_NE(drawn(textOf("a\xFF z", 40)), drawn(textOf("a z", 40)));
}

TEST_F(TextPainterTest, BoundsTheSize) {
  const Picture nothing = drawn(textOf("", 40));
  EXPECT_EQ(drawn(textOf("H", 0)), nothing);
  EXPECT_EQ(drawn(textOf("H", -40)), nothing);
  EXPECT_EQ(drawn(textOf("H", std::numeric_limits<int32_t>::max())), drawn(textOf("H", 1024)));
}

TEST_F(TextPainterTest, ScriptsOfTheListHaveTheirGlyphs) {
  constexpr auto kPairs = std::to_array<std::pair<const char*, const char*>>({
      {"한", "국"},
      {"中", "文"},
      {"日", "語"},
      {"あ", "ん"},
      {"ש", "ל"},
      {"ع", "س"},
      {"ไ", "ย"},
      {"ह", "न"},
      {"Ж", "Я"},
      {"Ω", "Σ"},
  });
  const int missing = drawn(textOf("\U000F0000", 60)).inkIn(kWideArea);
  for (const auto& [one, other] : kPairs) {
    const Picture first = drawn(textOf(one, 60));
    const Picture second = drawn(textOf(other, 60));
    EXPECT_GT(first.inkIn(kWideArea), 50) << one;
    EXPECT_NE(first, second) << one << " looks like " << other << ", a missing glyph?";
    EXPECT_NE(first.inkIn(kWideArea), missing) << one;
  }
}

TEST_F(TextPainterTest, RightToLeftTextRunsFromTheRight) {
  // Alef alone stands where a text of alef and three bets starts: at its right end.
  const Picture text = drawn(textOf("אבבב", 60, kWhite, 2));
  const Picture first = drawn(textOf("א", 60, kWhite, 2));
  const Area end = {390, 10, 30, 80};
  EXPECT_GT(first.inkIn(end), 50);
  EXPECT_EQ(text.inkIn(end), first.inkIn(end));
}

TEST_F(TextPainterTest, KeepsABoundedNumberOfLayouts) {
  drawn(textOf("kept", 30));
  const Picture before = drawn(textOf("kept", 30));
  EXPECT_EQ(painter.layoutCount(), 1U);
  drawn(textOf("kept", 31));
  drawn(textOf("kept", 30, kRed));
  EXPECT_EQ(painter.layoutCount(), 3U);
  for (int i = 0; i < 2000; ++i) drawn(textOf(std::to_string(i), 10));
  EXPECT_EQ(painter.layoutCount(), TextPainter::kMostLayouts);
  EXPECT_EQ(drawn(textOf("kept", 30)), before);
}

TEST(MissingFontTest, IsToldOnceAndTextIsStillDrawn) {
  const auto files = std::to_array<const char*>({"/nowhere/None.ttf", projectFontFiles()[0]});
  testing::internal::CaptureStderr();
  TextPainter painter(files);
  const Canvas canvas(kScreen);
  painter.draw(canvas, kWide, textOf("Hill", 40), kWideArea);
  const std::string told = testing::internal::GetCapturedStderr();
  EXPECT_EQ(std::ranges::count(told, '\n'), 1);
  EXPECT_NE(told.find("/nowhere/None.ttf"), std::string::npos);
  EXPECT_GT(pictureOf(canvas.surface()).inkIn(kWideArea), 100);
}

TEST(MissingFontTest, WithoutAnyFontNothingFails) {
  testing::internal::CaptureStderr();
  TextPainter painter(std::span<const char* const>{});
  const Canvas canvas(kScreen);
  painter.draw(canvas, kWide, textOf("Hill 한국어", 40), kWideArea);
  testing::internal::GetCapturedStderr();
  EXPECT_EQ(canvas.size(), kScreen);
}

}  // namespace
}  // namespace brimol::pc
