#include <MW/button3.h>

#include <array>
#include <cstring>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using Button3Test = WidgetTest;
using MW::Button3;

// Three columns and three rows of squares.
struct Grid {
  int w, h, side;
  std::array<int, 3> left, top;
};
constexpr auto kGrids = std::to_array<Grid>({{1440, 2560, 441, {28, 497, 966}, {28, 1060, 2091}},
                                             {2560, 1440, 785, {51, 887, 1723}, {51, 328, 604}},
                                             {1081, 1921, 331, {21, 373, 725}, {21, 795, 1569}}});
constexpr std::array kRowByRow = {10, 12, 11, 7, 9, 8, 1, 5, 2};

TEST_F(Button3Test, StandsByItsPosition) {
  for (const auto& [w, h, side, left, top] : kGrids) {
    setScreen(w, h);
    for (std::size_t i = 0; i < kRowByRow.size(); ++i) {
      Button3 button(kRowByRow.at(i), nullptr, 100);
      button.setRect(6, nullptr);                        // no position: it stays
      const int y = top.at(i / 3) - (i >= 6 ? 100 : 0);  // room below the last row alone
      EXPECT_EQ(shown(button).front().rect, (SKIA_Rect{left.at(i % 3), y, side, side, 0xFFFFFFFF}));
    }
  }
}

TEST_F(Button3Test, VerdictsGoByThePosition) {
  const std::vector<std::pair<int, std::string>> verdicts = {
      {Button3::kBottomLeft, "|PASS|"}, {Button3::kBottomCentre, "|RETRY|"}, {3, "|FAIL|"}};
  for (const auto& [position, drawn] : verdicts)
    EXPECT_EQ(words(shown(*std::make_unique<Button3>(position))), drawn);
  Button3 button(Button3::kBottomLeft);
  EXPECT_EQ(shown(button).front().text, (DrawnText{"", MW::kColorBlue, 0, 0}));
}

// The new length goes to the button box's own text, which stays empty.
TEST_F(Button3Test, ANewCaptionKeepsTheLengthOfTheFirst) {
  Button3 button(Button3::kBottomLeft);
  const std::vector<std::pair<const char*, std::string>> captions = {
      {"RETRY", "RETR"},
      {"OK", std::string("OK\0\0", 4)},
      {"a\u00e4\u00f6", std::string("a\u00e4\0", 4)},  // whole characters
      {"FAIL", "FAIL"},
      {button.getText(), "FAIL"}};
  for (const auto& [given, caption] : captions) {
    button.setText(given);
    EXPECT_EQ(words(shown(button)), std::string(std::strlen(given), '\0') + '|' + caption + '|');
  }
}

TEST_F(Button3Test, InitStartsOver) {
  const auto button = makes<Button3, Told::Zero>(Button3::kBottomLeft)();
  EXPECT_TRUE(button->isActive());
  static_cast<Button3&>(*button).init(Button3::kTopLeft, nullptr, nullptr, 0);
  EXPECT_FALSE(button->isActive());
  EXPECT_FALSE(button->pressCallback);
  EXPECT_EQ(words(shown(*button)), "|");
}

TEST_F(Button3Test, IsPressedLikeAnyButton) {
  const Maker make = makes<Button3, Told::Zero>(Button3::kBottomLeft);
  EXPECT_EQ(played(make, {press(28, 2091), lookAtLog(), release(), lookAtLog()}),
            "press+ <[BUTTON3] pressed!!> click+ <[BUTTON3] released!!>");
}

}  // namespace
