#include <MW/static_text.h>

#include <algorithm>
#include <array>
#include <random>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using StaticTextTest = WidgetTest;

constexpr SKIA_Rect kFourRows = {0, 0, 20, 60, 3};  // of ten bytes

struct Viewer : MW::StaticText {
  using StaticText::top_index, StaticText::w_count;
  explicit Viewer(SKIA_Rect area, SKIA_Text looks = textRecord("", 7, 1, 10), bool numbers = true)
      : StaticText(&area, &looks, numbers, true, true) {}
  std::string rows(int top) {
    top_index = top;
    return words(shown(*this));
  }
  // The top rows that a search, two steps forward and two back lead to.
  std::string found(const std::string& log, const std::string& wanted) {
    setText(log.c_str());
    get_ime_result(wanted.c_str());
    line_search(log.c_str());
    std::string tops = std::to_string(top_index);
    for (const unsigned int direction : {1U, 1U, 0U, 0U}) {
      line_search_point(direction);
      tops += std::to_string(top_index);
    }
    return tops;
  }
};

// Behind a text of several rows an empty one is drawn.
TEST_F(StaticTextTest, CutsTextsAndFindsTheirLines) {
  const std::string x(1000, 'x');
  const std::array<std::array<std::string, 4>, 9> searches = {{
      {"", "ab", "00000", "00001: |no log|"},
      {"0123456789\nx", "6", "00000", "00001:|0123456789||00002:|x||"},
      {"12345678\xE2\x82\xACx", "89", "00000", "00001:|12345678|\xE2\x82\xACx||"},
      {"a\nab and more\nc\nd", "ab", "11111", "00001:|a|00002:|!ab and mor|!e|00003:|c|"},
      {"a\nb\nab\nd\nab\nf\n\n\nz", "ab", "24422", "00001:|a|00002:|b|00003:|!ab|00004:|d|"},
      // No further than the last page; the last row counts as the first; no line is counted.
      {"ab\nb\nc\nd\ne\nab\nz", "ab", "03300", "00001:|!ab|00002:|b|00003:|c|00004:|d|"},
      {"a\nab\nb\nc\nab", "ab", "11100", "00001:|a|00002:|!ab|00003:|b|00004:|c|"},
      {"a\nb\nc\nb", "\nb", "00000", "00001:|!a|00002:|b|00003:|c|00004:|b|"},
      {"b\n" + x.substr(901), x, "11111", "00001:|b|00002:|!xxxxxxxxxx|!xxxxxxxxxx|!xxxxxxxxxx|"},
  }};
  Viewer viewer(kFourRows);
  for (const auto& [text, wanted, tops, rows] : searches) {
    EXPECT_EQ(viewer.found(text, wanted), tops);
    EXPECT_EQ(viewer.rows(0), rows);
  }
  viewer.setText(std::string(123456, '\n').c_str());
  EXPECT_EQ(viewer.rows(viewer.find_real_num(123456)), "99999:||99999:||99999:||99999:||");
  Viewer plain(kFourRows, textRecord("", 7, 1, 10), false);
  plain.found("a\nab\nc\nd", "ab");
  EXPECT_EQ(plain.rows(0), "a|!ab|!c|!d|");
  EXPECT_EQ(plain.rows(2), "!c|!d|!|") << "in the next frame too";
}

TEST_F(StaticTextTest, DrawnRowsGiveTheTextBack) {
  constexpr std::array kPieces = {"word", "\n", "\r\x02\x03", "\xE2\x82\xAC", "\x80\x80\x80\xFF"};
  Viewer viewer({0, 0, 0, 10'000, 0});
  std::minstd_rand random(5);
  for (int round = 0; round < 300; ++round) {
    std::string text;
    for (auto i = random() % 200; i > 0; --i) text += kPieces.at(random() % 5);
    viewer.w_count = static_cast<int>(random() % 140) - 5;
    viewer.setText((text + '\n').c_str());
    std::string joined;
    for (const Drawing& each : shown(viewer)) {
      joined += each.text.color == MW::kColorBlue ? "\n" : each.text.text;
      EXPECT_LE(each.text.text.size(), std::clamp(viewer.w_count, 6, 127));
    }
    std::erase_if(text, [](char c) { return c == '\r' || c == '\x02' || c == '\x03'; });
    EXPECT_EQ(joined, '\n' + text);
  }
}

TEST_F(StaticTextTest, ALongPressOnTheBarScrollsAClock) {
  platform().properties["brimol.info.type"] = "cpu";
  Viewer viewer({100, 50, 350, 700, 5}, textRecord("", 7, 2, 20));
  EXPECT_EQ(viewer.w_count, 88);
  viewer.setText(std::string(66, '\n').c_str());  // of which 33 are in view
  EXPECT_EQ(places(shown(viewer)).substr(0, 46), "100,50 350x700|110,70 350x20|190,70 350x20|110");
  for (const auto& [y, top] : {std::pair(224, 50), {225, 166}, {400, 283}, {749, 400}, {60, 50}}) {
    longPress(viewer, {422, y});
    EXPECT_EQ(places({shown(viewer).back()}), "429," + std::to_string(top) + " 14x350|");
  }
  viewer.setRect(0, &kFourRows);
  EXPECT_EQ(viewer.w_count, 0) << "it knows of its numbers by now";
}

TEST_F(StaticTextTest, AFingerScrollsAndTaps) {
  static int doubles = 0;
  Viewer viewer(kFourRows);
  viewer.setText("1\n2\n3\n4\n5\n6");
  viewer.double_tap_cb = [](int zero) { doubles += zero + 1; };
  for (const unsigned int ticks : {1000U, 1400U, 1800U, 2300U, 2500U}) {
    platform().ticks = ticks;
    press(viewer, {5, 5});
    for (int i = 0; i < 3; ++i) offer(viewer, {MW::kEventMotion, {{0, 0, 5, 5, 0, -9}}});
    EXPECT_EQ(viewer.top_index, std::min((ticks - 1000) / 400, 2U)) << "by every fourth motion";
    release(viewer, {5, 5});
    EXPECT_EQ(doubles, ticks < 1400 ? 0 : 1) << "not a third, nor one that comes late";
  }
  viewer.onShowTimer(100);
  EXPECT_FALSE(press(viewer, {5, 5})) << "for good";
}

TEST_F(StaticTextTest, NoSizeLeadsOutOfBounds) {
  SKIA_Text looks = {};
  std::ranges::fill(looks.text, 'x');  // no NUL
  for (const int size : {INT_MIN, -1, 0, 1, 7, INT_MAX}) {
    for (const int length : {INT_MIN, -50, 0, 3, 300, INT_MAX}) {
      looks.size = size;
      Viewer viewer({INT_MAX, INT_MIN, length, length, 0}, looks);
      viewer.line_search(nullptr);
      viewer.found(std::string(1'000'000, 'y'), "yyy");
      for (const int y : {INT_MIN, INT_MAX}) longPress(viewer, {INT_MAX, y});
      EXPECT_EQ(viewer.rows(99).find("outside"), std::string::npos);
    }
  }
}

}  // namespace
