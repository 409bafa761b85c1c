// What the widgets of a test menu draw, as far as it depends on the screen or a text.

#include <MW/button3.h>
#include <MW/screen.h>
#include <MW/slide.h>

#include <array>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MenuDrawingTest = WidgetTest;

// Three columns and three rows of squares.
struct Grid {
  int w, h, side;
  std::array<int, 3> left, top;
};
constexpr auto kGrids = std::to_array<Grid>({{1440, 2560, 441, {28, 497, 966}, {28, 1060, 2091}},
                                             {1080, 1920, 331, {21, 373, 725}, {21, 795, 1568}},
                                             {720, 1280, 220, {14, 248, 482}, {14, 530, 1046}},
                                             {2560, 1440, 785, {51, 887, 1723}, {51, 328, 604}},
                                             {1081, 1921, 331, {21, 373, 725}, {21, 795, 1569}}});
constexpr std::array kPositions = {10, 12, 11, 7, 9, 8, 1, 5, 2};  // row by row

TEST_F(MenuDrawingTest, VerdictButtonsStandByTheirPositions) {
  for (const auto& [w, h, side, left, top] : kGrids) {
    setScreen(w, h);
    for (std::size_t i = 0; i < kPositions.size(); ++i) {
      MW::Button3 button(kPositions.at(i), nullptr, 100);
      button.setRect(6, nullptr);                        // no position: it stays
      const int y = top.at(i / 3) - (i >= 6 ? 100 : 0);  // room below the last row alone
      EXPECT_EQ(shown(button).front().rect, (SKIA_Rect{left.at(i % 3), y, side, side, 0xFFFFFFFF}));
    }
  }
}

// The new length goes to the button box's own text, which stays empty.
TEST_F(MenuDrawingTest, VerdictButtonsKeepTheLengthOfTheirCaption) {
  const std::string gap(3, '\0');
  MW::Button3 button(1);
  const auto drawn = [&button](const char* given) {
    button.setText(given);
    EXPECT_EQ(shown(button).at(0).text.text,
              std::string(given == nullptr ? 0 : strlen(given), '\0'));
    return shown(button).at(1).text.text;
  };
  EXPECT_EQ(shown(button).at(1).text.text, "PASS");
  EXPECT_EQ(drawn("RETRY"), "RETR");
  EXPECT_EQ(drawn("OK"), "OK" + gap.substr(1));
  EXPECT_EQ(drawn("a\u00e4\u00f6"), "a\u00e4" + gap.substr(2)) << "whole characters";
  EXPECT_EQ(drawn(nullptr), gap + '\0');
  EXPECT_EQ(drawn("FAIL"), "FAIL");
}

// A slide's second caption has its record's length, but only as many bytes as its size says.
TEST_F(MenuDrawingTest, SlidesCutTheirSecondCaptionByItsSize) {
  for (const int size : {INT_MIN, 0, 3, 6, 80}) {
    const SKIA_Rect area = {10, 20, 300, 101, 0};
    const SKIA_Text caption = textRecord("LOCKED", 0, 0, size);
    MW::Slide slide(0, &area, nullptr, &caption);
    std::string expected =
        std::string("LOCKED").substr(0, static_cast<std::size_t>(std::max(size, 0)));
    expected.resize(6);
    EXPECT_EQ(shown(slide).at(5).text.text, expected);
  }
}

TEST_F(MenuDrawingTest, FilledScreensAreGreyBehindFourColors) {
  MW::FullScreen fill(3);
  EXPECT_EQ(shown(fill).front().rect, (SKIA_Rect{0, 0, 1441, 2561, 0xFF0000FF}));
  for (const int number : {4, -1, INT_MIN}) {
    fill.setRect(number);
    EXPECT_EQ(shown(fill).front().rect.color, 0xFFBFBFBF);
  }
}

}  // namespace
