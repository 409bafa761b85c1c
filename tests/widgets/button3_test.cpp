#include <MW/button3.h>

#include <array>
#include <cstring>

#include "support/drawings.h"
#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using Button3Test = WidgetTest;
using MW::Button3;

// Three columns and three rows of squares.
struct Grid : Row {
  int w, h, side;
  std::array<int, 3> left, top;
};
class Button3Grid : public WidgetTest, public testing::WithParamInterface<Grid> {};

TEST_P(Button3Grid, PlacesByPositions) {
  constexpr std::array kRowByRow = {
      Button3::kTopLeft,    Button3::kTopCentre,    Button3::kTopRight,
      Button3::kMiddleLeft, Button3::kMiddleCentre, Button3::kMiddleRight,
      Button3::kBottomLeft, Button3::kBottomCentre, Button3::kBottomRight};
  const Grid& grid = GetParam();
  setScreen(grid.w, grid.h);
  for (std::size_t i = 0; i < kRowByRow.size(); ++i) {
    Button3 button(kRowByRow.at(i), nullptr, 100);
    button.setRect(6, nullptr);                             // no position: it stays
    const int y = grid.top.at(i / 3) - (i >= 6 ? 100 : 0);  // room below the last row alone
    EXPECT_EQ(shown(button).front().rect,
              (SKIA_Rect{grid.left.at(i % 3), y, grid.side, grid.side, 0xFFFFFFFF}));
  }
}

const std::vector<Grid> kGrids = {
    {"Default", 1440, 2560, 441, {28, 497, 966}, {28, 1060, 2091}},
    {"FullHd", 1080, 1920, 331, {21, 373, 725}, {21, 795, 1568}},
    {"Hd", 720, 1280, 220, {14, 248, 482}, {14, 530, 1046}},
    {"Lying", 2560, 1440, 785, {51, 887, 1723}, {51, 328, 604}},
    {"Odd", 1081, 1921, 331, {21, 373, 725}, {21, 795, 1569}},
};
INSTANTIATE_TEST_SUITE_P(, Button3Grid, testing::ValuesIn(kGrids), kRowName);

TEST_F(Button3Test, CaptionsStandOneAboveTheOther) {
  const SKIA_Text first = textRecord("PASS");
  const SKIA_Text second = textRecord("all of it");
  Button3 button(Button3::kBottomLeft, &first, &second, 0);
  EXPECT_EQ(places(shown(button)), "28,2091 441x441|28,2091 441x220|28,2311 441x220|");
  EXPECT_EQ(words(shown(button)), "|PASS|all of it|");
}

TEST_F(Button3Test, VerdictsGoByThePosition) {
  const std::vector<std::pair<int, std::string>> verdicts = {
      {Button3::kBottomLeft, "PASS"}, {Button3::kBottomCentre, "RETRY"}, {3, "FAIL"}};
  for (const auto& [position, verdict] : verdicts) {
    Button3 button(position);
    EXPECT_EQ(words(shown(button)), '|' + verdict + '|');
  }
}

// The new length goes to the button box's own text, which stays empty.
TEST_F(Button3Test, ANewCaptionKeepsTheLengthOfTheFirst) {
  Button3 button(Button3::kBottomLeft);
  const std::vector<std::pair<const char*, std::string>> captions = {
      {"RETRY", "RETR"},
      {"OK", std::string("OK\0\0", 4)},
      {"a\u00e4\u00f6", std::string("a\u00e4\0", 4)},  // whole characters
      {nullptr, std::string(4, '\0')},
      {"FAIL", "FAIL"},
      {button.getText(), "FAIL"}};
  for (const auto& [given, caption] : captions) {
    const std::size_t length = given == nullptr ? 0 : std::strlen(given);
    button.setText(given);
    EXPECT_EQ(shown(button).at(0).text.text, std::string(length, '\0'));
    EXPECT_EQ(shown(button).at(1).text.text, caption);
  }
}

TEST_F(Button3Test, IsPressedLikeAnyButton) {
  const Maker make = makes<Button3, Told::Zero>(Button3::kBottomLeft);
  EXPECT_EQ(played(make, {press(28, 2091), lookAtLog(), release(), lookAtLog()}),
            "press+ <[BUTTON3] pressed!!> click+ <[BUTTON3] released!!>");
}

}  // namespace
