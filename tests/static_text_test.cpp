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
  explicit Viewer(SKIA_Rect area, int size = 10, bool numbers = true, SKIA_Text looks = {})
      : StaticText(&area, &(looks.size = size, looks), numbers, true, true) {}
  // The labels from row `top` on, red ones behind a "!".
  std::string rows(int top) {
    top_index = top;
    std::string all;
    for (const Drawing& each : shown(*this)) {
      if (each.call != Call::Label) continue;
      all += (each.text.color == 0xFFFF0000 ? "!" : "") + each.text.text + '|';
    }
    return all;
  }
  // A search, two steps forward and two back: the top rows that they lead to.
  std::string found(const std::string& log, const std::string& wanted) {
    setText(log.c_str());
    get_ime_result(wanted.c_str());
    top_index = 0;
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
  const std::array<std::string, 4> searches[] = {
      {"", "ab", "00000", "00001: |no log|"},
      {"\r\n", "", "00000", "00001:||"},
      {"o\x02ne\r\n\x03two\n", "x", "00000", "00001:|one|00002:|two||"},
      {"0123456789\nx", "6", "00000", "00001:|0123456789||00002:|x||"},
      {"12345678\xE2\x82\xACx", "", "00000", "00001:|12345678|\xE2\x82\xACx||"},
      {"1234567\xE2\x82\xAC", "89", "00000", "00001:|1234567\xE2\x82\xAC|||"},
      {"a\nab and more\nc\nd", "ab", "11111", "00001:|a|00002:|!ab and mor|!e|00003:|c|"},
      {"a\nb\nab\nd\nab\nf\n\n\nz", "ab", "24422", "00001:|a|00002:|b|00003:|!ab|00004:|d|"},
      // No further than the last page; the last row counts as the first; no line is counted.
      {"ab\nb\nc\nd\ne\nab\nz", "ab", "03300", "00001:|!ab|00002:|b|00003:|c|00004:|d|"},
      {"a\nab\nb\nc\nab", "ab", "11100", "00001:|a|00002:|!ab|00003:|b|00004:|c|"},
      {"a\nb\nc\nb", "\nb", "00000", "00001:|!a|00002:|b|00003:|c|00004:|b|"},
      {"a\nb" + x.substr(901), x, "11111", "00001:|a|00002:|!bxxxxxxxxx|!xxxxxxxxxx|!xxxxxxxxxx|"},
  };
  Viewer viewer(kFourRows);
  viewer.line_search(nullptr);
  for (const auto& [text, wanted, tops, rows] : searches) {
    EXPECT_EQ(viewer.found(text, wanted), tops);
    EXPECT_EQ(viewer.rows(0), rows);
  }
  EXPECT_EQ(viewer.find_real_num(2), 1);
  viewer.setText(std::string(123456, '\n').c_str());
  EXPECT_EQ(viewer.rows(9998).substr(0, 16), "09999:||10000:||");
  EXPECT_EQ(viewer.rows(viewer.find_real_num(123456)), "99999:||99999:||99999:||99999:||");
}

TEST_F(StaticTextTest, WithoutNumbersRedGoesOnInTheNextFrame) {
  Viewer viewer(kFourRows, 10, false);
  viewer.found("a\nab\nc\nd", "ab");
  EXPECT_EQ(viewer.rows(0), "a|!ab|!c|!d|");
  EXPECT_EQ(viewer.rows(2), "!c|!d|!|");
}

TEST_F(StaticTextTest, DrawnRowsGiveTheTextBack) {
  const std::string pieces[] = {"a",        "word",     "\n",           "\r\n",
                                "\x02\x03", "\xC3\xA4", "\xE2\x82\xAC", "\x80\x80\x80\x80",
                                "\xFF"};
  Viewer viewer({0, 0, 0, 10'000, 0});
  std::minstd_rand random(5);
  for (int round = 0; round < 300; ++round) {
    const bool isValid = round % 2 == 0;
    std::string text;
    for (auto i = random() % 200; i > 0; --i) text += pieces[random() % (isValid ? 7 : 9)];
    viewer.w_count = static_cast<int>(random() % 140) - 5;
    viewer.setText((text + '\n').c_str());
    std::string joined;
    for (const Drawing& each : shown(viewer)) {
      const std::string& row = each.text.text;
      const bool isNumber = each.text.color == MW::kColorBlue;
      joined += isNumber ? "\n" : row;
      EXPECT_LE(row.size(), isNumber ? 6 : std::clamp(viewer.w_count, 1, 127));
      EXPECT_FALSE(isValid && viewer.w_count > 2 && !row.empty() && (row[0] & 0xC0) == 0x80);
    }
    std::erase_if(text, [](char c) { return c == '\r' || c == '\x02' || c == '\x03'; });
    EXPECT_EQ(joined, '\n' + text);
  }
}

TEST_F(StaticTextTest, ALongPressOnTheBarScrolls) {
  Viewer viewer({100, 50, 350, 700, 5}, 20);
  viewer.setText((std::string(64, '\n') + "e\ne").c_str());  // 66 rows, of which 33 are in view
  EXPECT_EQ(places(shown(viewer)).substr(0, 46), "100,50 350x700|110,70 350x20|190,70 350x20|110");
  for (const auto& [y, top] : {std::pair(224, 0), {225, 11}, {400, 22}, {575, 33}, {749, 33}}) {
    longPress(viewer, {422, y});
    const std::string barTop = std::to_string(50 + top * 350 / 33);
    EXPECT_EQ(places({shown(viewer).back()}), "429," + barTop + " 14x350|");
  }
  longPress(viewer, {421, 60});
  EXPECT_EQ(viewer.top_index, 33) << "beside the bar's column";
}

TEST_F(StaticTextTest, AClockViewHasItsOwnWidth) {
  platform().properties["brimol.info.type"] = "cpu";
  Viewer viewer(kFourRows);
  EXPECT_EQ(viewer.w_count, 88);
  viewer.top_index = 50;
  viewer.setText("short");
  EXPECT_EQ(platform().takeLog().rbegin()[1].message, "[STATICTEXT] max_num_of_lines : 54");
  viewer.setRect(0, &kFourRows);
  EXPECT_EQ(viewer.w_count, 2) << "there is a flag by now, and no clock any more";
}

TEST_F(StaticTextTest, AFingerScrollsAndTaps) {
  static int doubles = 0;
  Viewer viewer(kFourRows);
  viewer.setText("1\n2\n3\n4\n5\n6");
  viewer.double_tap_cb = [](int zero) { doubles += zero + 1; };
  MW::event_data up = pointerEvent(MW::kEventMotion, {5, 5});
  up.mouse.yrel = -9;
  EXPECT_FALSE(offer(viewer, up)) << "not held";
  for (const unsigned int ticks : {1000U, 1400U, 1800U, 2300U, 2500U}) {
    platform().ticks = ticks;
    press(viewer, {5, 5});
    for (int motion = 0; motion < 3; ++motion) offer(viewer, up);
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
  const std::string longLine(1'000'000, 'y');
  for (const int size : {INT_MIN, -1, 0, 1, 7, INT_MAX}) {
    for (const int length : {INT_MIN, -50, 0, 3, 300, INT_MAX}) {
      Viewer viewer({INT_MAX, INT_MIN, length, length, 0}, size, true, looks);
      viewer.found(longLine, "yyy");
      for (const int top : {INT_MIN, 9999, INT_MAX}) viewer.rows(top);
      for (const int y : {INT_MIN, INT_MAX}) longPress(viewer, {INT_MAX, y});
      for (const Drawing& each : shown(viewer)) EXPECT_LE(each.text.text.size(), 127U);
    }
  }
}

}  // namespace
