// Texts and picture files as an item shows them.
#include "painter/picture_cache.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <limits>
#include <memory>
#include <random>

#include "pc/support/painting.h"

namespace brimol::pc {
namespace {

using namespace std::string_literals;

constexpr SKIA_Rect kWide = {20, 10, 400, 80, 0};
constexpr Area kWideArea = {20, 10, 400, 80};
constexpr Size kScreen = {440, 100};

/// A file for the test that runs.
std::string fileOf(const std::string& name, const std::string& bytes) {
  std::string path = testing::TempDir() + "/text_test." + std::to_string(getpid()) + name;
  std::ofstream(path, std::ios::binary) << bytes;
  return path;
}

Picture drawn(const SKIA_Text& text) {
  return painted({textItem(SKIA_TEXTBOX, kWide, text)}, kScreen);
}
Picture drawn(std::string_view words, int32_t size = 40) { return drawn(textOf(words, size)); }

TEST(Text, IsAlignedLineByLineAndCentredInHeight) {
  const auto inkOf = [](int32_t align) { return drawn(textOf("Hill", 40, kWhite, align)).inked(); };
  EXPECT_NEAR(inkOf(2).x + inkOf(2).width, 420, 8);
  EXPECT_NEAR(2 * inkOf(5).x + inkOf(5).width, 440, 8);
  for (const int32_t left : {0, 1, 3, 4, 6, -1}) EXPECT_NEAR(inkOf(left).x, 20, 8) << left;
  const Picture lines = drawn(textOf("i\nwide words", 30, kWhite, 2));
  EXPECT_GT(lines.inkIn({410, 15, 10, 35}), 0) << "the short line stands at the right edge";
  for (const int size : {20, 40, 60}) {
    const Area ink = drawn("H", size).inked();
    EXPECT_NEAR(ink.height, 0.711 * size, 1.5) << "a capital's share of the size";
    EXPECT_NEAR(2 * ink.y + ink.height, 100, size / 5.0 + 2) << size;
  }
}

Area inkOf(std::string_view words, const Area& box) {
  const SKIA_Rect rect = {box.x, box.y, box.width, box.height, 0};
  return painted({textItem(SKIA_LABEL, rect, textOf(words, 40))}, {440, 240}).inked();
}

TEST(Text, IsNotCutInHeightByARectangleThatIsLower) {
  for (const char* const words : {"Äpfel gÿ", "한국어 中", "שלוםץ", "عربي چ", "ฎฏปู่", "हिन्दी कु"}) {
    const Area whole = inkOf(words, {20, 0, 400, 240});
    EXPECT_GT(whole.height, 20) << words;
    for (const int32_t height : {1, 20, 40}) {
      const Area ink = inkOf(words, {20, 120 - height / 2, 400, height});
      EXPECT_EQ(ink.height, whole.height) << words << " in " << height;
      EXPECT_EQ(ink.width, whole.width) << words << " in " << height;
    }
  }
  EXPECT_EQ(inkOf("glyph", {20, 120, 400, 0}).height, 0);
}

TEST(Text, ShowsTheLinesWholeWhoseMiddleLiesInTheRectangle) {
  const int one = inkOf("gap", {20, 100, 400, 40}).height;
  const int three = inkOf("gap\ngap\ngap", {20, 0, 400, 240}).height;
  EXPECT_GT(three, 3 * one);
  EXPECT_EQ(inkOf("gap\ngap\ngap", {20, 100, 400, 40}).height, one);
  EXPECT_EQ(inkOf("gap\rgap\ngap", {20, 70, 400, 100}).height, three);
}

TEST(Text, IsCutAtTheSidesAndTakesItsColourAndAlpha) {
  const auto pixelOf = [](uint32_t color) { return drawn(textOf("████", 60, color)).at(60, 50); };
  EXPECT_EQ(pixelOf(0xFF123456), 0x123456U);
  EXPECT_EQ(pixelOf(0x80FFFFFF), 0x808080U);
  EXPECT_EQ(pixelOf(0x00FFFFFF), 0U);
  EXPECT_EQ(drawn("████████████████████", 120).inked(), (Area{20, 0, 400, 100}));
}

TEST(Text, OfAnyLengthSizeAndBytesIsDrawnAsFarAsItGoes) {
  const Picture nothing = drawn("");
  SKIA_Text text = textOf("HillHill", 40);
  text.string_len = 4;
  EXPECT_EQ(drawn(text), drawn("Hill"));
  text.string_len = -5;
  EXPECT_EQ(drawn(text), nothing);
  std::ranges::fill(text.text, 'i');
  text.string_len = std::numeric_limits<int32_t>::max();
  EXPECT_EQ(drawn(text), drawn(std::string(127, 'i')));
  EXPECT_EQ(drawn("a\xFF z"), drawn("a\uFFFD z"));
  EXPECT_EQ(drawn("H", -40), nothing);
  EXPECT_EQ(drawn("H", std::numeric_limits<int32_t>::max()), drawn("H", 1024));
}

TEST(Text, OfEveryScriptHasGlyphsAndDirection) {
  const Picture missing = drawn("\U000F0000", 60);
  for (const char* const sign : {"한", "中", "あ", "ש", "ع", "ไ", "ह", "Ж", "Ω"}) {
    EXPECT_NE(drawn(sign, 60).inkIn(kWideArea), missing.inkIn(kWideArea)) << sign;
    EXPECT_GT(drawn(sign, 60).inkIn(kWideArea), 50) << sign;
  }
  // Alef alone stands where a text of alef and three bets starts: at its right end.
  const Area end = {390, 10, 30, 80};
  const int alef = drawn(textOf("א", 60, kWhite, 2)).inkIn(end);
  EXPECT_GT(alef, 50);
  EXPECT_EQ(drawn(textOf("אבבב", 60, kWhite, 2)).inkIn(end), alef);
}

// Plain texts are shaped by what others have taught; a new painter knows nothing yet.
TEST(Text, LooksTheSameOnceItsLettersAreKnown) {
  constexpr auto kStarts = std::to_array<const char*>({"", "office ", "AV To ", "12:"});
  std::mt19937 random(7);
  Painter taught(kScreen);
  for (int round = 0; round < 400; ++round) {
    std::string words = kStarts.at(random() % kStarts.size());
    for (auto count = random() % 40; count > 0; --count) {
      words += static_cast<char>(' ' + random() % 95);
    }
    const SKIA_Text text = textOf(words, 9 + round % 3 * 20, round % 2 == 0 ? kWhite : 0x80FF8020);
    const Frame frame = {boxItem({0, 0, 300, 50, kBlue}), textItem(SKIA_LABEL, kWide, text)};
    taught.paint(frame);
    ASSERT_EQ(pictureOf(taught.picture()), painted(frame, kScreen)) << words;
  }
}

// What `pc_text_sum` prints in an environment with that variable.
std::string sumWith(const std::string& variable) {
  const std::string command = "env '" + variable + "' " + TEXT_SUM_PROGRAM;
  const std::unique_ptr<FILE, int (*)(FILE*)> output(popen(command.c_str(), "r"), pclose);
  std::array<char, 100> line = {};
  return std::fgets(line.data(), line.size(), output.get()) == nullptr ? "" : line.data();
}

TEST(Text, LooksTheSameInAnySurroundings) {
  const std::string fonts =
      fileOf("fonts",
             "<fontconfig><match target='font'><edit name='embolden' mode='assign'>"
             "<bool>true</bool></edit></match><dir>/usr/share/fonts</dir></fontconfig>");
  const std::string expected = sumWith("LC_ALL=C");
  EXPECT_NE(expected, "");
  for (const auto& setting : {"LC_ALL=C.UTF-8"s, "PANGO_LANGUAGE=ja:ur:tr:mr:sr"s, "FC_LANG=ja"s,
                              "GDK_DPI_SCALE=2"s, "FONTCONFIG_FILE=" + fonts}) {
    EXPECT_EQ(sumWith(setting), expected) << setting;
  }
}

/// A PNG file of one colour.
std::string redFile() {
  std::string path = fileOf("red.png", "");
  Painter painter({3, 3});
  painter.paint({boxItem({0, 0, 3, 3, kRed})});
  EXPECT_EQ(cairo_surface_write_to_png(painter.picture(), path.c_str()), CAIRO_STATUS_SUCCESS);
  return path;
}

Picture shown(int32_t kind, const std::string& file) {
  return painted({textItem(kind, {10, 10, 30, 20, 0}, textOf(file, 0))});
}

TEST(PictureFile, FillsAnImageOrAnUnsizedLabelAndOtherwiseShowsThatItIsNone) {
  const std::string file = redFile();
  EXPECT_EQ(shown(SKIA_IMAGE, file), painted({boxItem({10, 10, 30, 20, kRed})}));
  EXPECT_EQ(shown(SKIA_LABEL, file), shown(SKIA_IMAGE, file));
  EXPECT_EQ(shown(SKIA_LABEL, ""), painted({}));
  const Picture missing = shown(SKIA_IMAGE, "/nowhere/none.png");
  EXPECT_EQ(missing.inked(), (Area{10, 10, 30, 20}));
  EXPECT_EQ(missing.at(25, 20), 0x808080U) << "a diagonal";
  const std::string words = fileOf("text", "no picture at all, though long enough to be one");
  const std::string pipe = words + ".pipe";
  mkfifo(pipe.c_str(), 0600);
  for (const auto& other : {pipe, testing::TempDir(), fileOf("none", ""), words, "/dev/zero"s}) {
    EXPECT_EQ(shown(SKIA_IMAGE, other), missing) << other;
  }
}

TEST(PictureFile, IsKeptInABoundedCacheThatForgetsTheLeastRecent) {
  PictureCache cache;
  const std::string file = redFile();
  EXPECT_EQ(cache.scaled(file, {8193, 1}), nullptr);
  EXPECT_EQ(cache.scaled(file, {8000, 8000}), nullptr);
  EXPECT_NE(cache.scaled(file, {9, 9}), nullptr);
  std::filesystem::rename(file, file + "2");
  for (int width = 1001; width < 1030; ++width) {
    EXPECT_NE(cache.scaled(file, {9, 9}), nullptr) << "from the cache";
    EXPECT_NE(cache.scaled(file + "2", {width, 1000}), nullptr);
  }
  std::filesystem::remove(file + "2");
  EXPECT_EQ(cache.scaled(file + "2", {1001, 1000}), nullptr);
  EXPECT_LE(cache.bytes(), PictureCache::kMostBytes);
}

}  // namespace
}  // namespace brimol::pc
