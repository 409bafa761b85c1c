#include <MW/button3.h>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Button3;

constexpr unsigned int kWhite = 0xFFFFFFFF;
constexpr unsigned int kHeld = 0xFF87CEFA;
const DrawnText kNoWords = {"", 0xFF0000FF, 0, 0};
const SKIA_Text kFirst = textRecord("Again", 0xFF111111, 5, 60);
const SKIA_Text kSecond = textRecord("from the start", 0xFF222222, 1, 30);

std::string calls;

class Button3Test : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
  }
};

struct GridCase : Row {
  int w, h;
  int side;
  int left, centre, right;
  int top, middle, bottom;
};

class Button3Grid : public Button3Test, public testing::WithParamInterface<GridCase> {};

TEST_P(Button3Grid, PlacesByPosition) {
  struct Cell {
    int position, x, y;
  };
  const GridCase& at = GetParam();
  setScreen(at.w, at.h);
  const std::initializer_list<Cell> cells = {
      {1, at.left, at.bottom}, {2, at.right, at.bottom}, {5, at.centre, at.bottom},
      {7, at.left, at.middle}, {8, at.right, at.middle}, {9, at.centre, at.middle},
      {10, at.left, at.top},   {11, at.right, at.top},   {12, at.centre, at.top}};
  for (const Cell& cell : cells) {
    SCOPED_TRACE(cell.position);
    Button3 button(cell.position, nullptr);
    EXPECT_EQ(shown(button),
              (std::vector{buttonBox({cell.x, cell.y, at.side, at.side, kWhite}, kNoWords)}));
    Button3 raised(cell.position, nullptr, 100);
    const int y = cell.y == at.bottom ? cell.y - 100 : cell.y;
    EXPECT_EQ(shown(raised).front().rect.y, y) << "room below the bottom row alone";
  }
}

INSTANTIATE_TEST_SUITE_P(
    Screens, Button3Grid,
    testing::Values(GridCase{{"Tall1440"}, 1440, 2560, 441, 28, 497, 966, 28, 1060, 2091},
                    GridCase{{"Tall1080"}, 1080, 1920, 331, 21, 373, 725, 21, 795, 1568},
                    GridCase{{"Tall720"}, 720, 1280, 220, 14, 248, 482, 14, 530, 1046},
                    GridCase{{"Landscape"}, 2560, 1440, 785, 51, 887, 1723, 51, 328, 604},
                    GridCase{{"Odd"}, 1081, 1921, 331, 21, 373, 725, 21, 795, 1569}),
    rowName);

TEST_F(Button3Test, OtherPositionsKeepThePlace) {
  setScreen(1080, 1920);
  for (const int position : {3, 4, 6, 0, -1, 13, INT_MIN, INT_MAX}) {
    SCOPED_TRACE(position);
    Button3 placeless(position);
    EXPECT_EQ(shown(placeless).front().rect, (SKIA_Rect{0, 0, 0, 0, kWhite}));
    EXPECT_FALSE(press(placeless, {0, 0}));
    Button3 placed(12);
    placed.setRect(position, nullptr);
    EXPECT_EQ(shown(placed).front().rect, (SKIA_Rect{373, 21, 331, 331, kWhite}));
  }
}

TEST_F(Button3Test, CaptionsItselfByPosition) {
  for (const int position : {1, 2, 5, 7, 3, -1}) {
    Button3 button(position);
    const std::string verdict = position == 1 ? "PASS" : position == 5 ? "RETRY" : "FAIL";
    EXPECT_EQ(shown(button).at(1).text, (DrawnText{verdict, 0, 0, 0})) << position;
  }
}

TEST_F(Button3Test, TwoCaptionsShareTheFace) {
  setScreen(1080, 1920);
  Button3 button(1, &kFirst, &kSecond, 0);
  EXPECT_EQ(shown(button),
            (std::vector{buttonBox({21, 1568, 331, 331, kWhite}, kNoWords),
                         label({21, 1568, 331, 165, 0}, {"Again", 0xFF111111, 5, 60}),
                         label({21, 1733, 331, 165, 0}, {"from the start", 0xFF222222, 1, 30})}));
  button.setTextColor(5);
  button.setFontSize(7);
  button.setTextAlign(2);
  EXPECT_EQ(shown(button).at(1).text, (DrawnText{"Again", 5, 5, 7})) << "the first one's";
  EXPECT_STREQ(button.getText(), "Again");
  EXPECT_EQ(button.getTextColor(), 5U);
  EXPECT_EQ(button.getFontSize(), 7);
  Button3 headless(1, nullptr, &kSecond, 0);
  EXPECT_EQ(shown(headless).at(1).text, DrawnText{}) << "room for a first one that is not there";
  EXPECT_EQ(shown(headless).at(2).text.text, "from the start");
}

struct CaptionCase : Row {
  const char* given;
  std::string caption;  // as it is drawn
  std::size_t own;      // the length of the button box's own text
};

class Button3Caption : public Button3Test, public testing::WithParamInterface<CaptionCase> {};

TEST_P(Button3Caption, KeepsItsFirstLength) {
  const SKIA_Text first = textRecord("PASS");
  Button3 button(1, &first);
  button.setText(GetParam().given);
  EXPECT_EQ(shown(button).at(0).text.text, nuls(GetParam().own));
  EXPECT_EQ(shown(button).at(1).text.text, GetParam().caption);
  button.setText("FAIL");
  EXPECT_EQ(shown(button).at(1).text.text, "FAIL") << "the length has not changed";
}

const std::string kLong(300, 'x');

INSTANTIATE_TEST_SUITE_P(
    Texts, Button3Caption,
    testing::Values(CaptionCase{{"Same"}, "DONE", "DONE", 4},
                    CaptionCase{{"Longer"}, "RETRY", "RETR", 5},
                    CaptionCase{{"Shorter"}, "OK", "OK" + nuls(2), 2},
                    CaptionCase{{"Empty"}, "", nuls(4), 0},
                    CaptionCase{{"Absent"}, nullptr, nuls(4), 0},
                    CaptionCase{{"TooLong"}, kLong.c_str(), "xxxx", 127},
                    CaptionCase{{"WholeCharacters"}, "a\u00e4\u00f6", "a\u00e4" + nuls(1), 5}),
    rowName);

TEST_F(Button3Test, IsPressedAsAButtonUnderItsOwnName) {
  setScreen(1080, 1920);
  Button3 button(5);
  button.pressCallback = [](int) { calls += 'p'; };
  button.clickCallback = [](int) { calls += 'c'; };
  button.longPressCallback = [](int) { calls += 'l'; };
  button.doubleClickCallback = [](int) { calls += 'd'; };
  platform().ticks = 1000;
  platform().takeLog();
  for (int i = 0; i < 2; ++i) {
    EXPECT_TRUE(press(button, {373, 1568}));
    EXPECT_EQ(shown(button).front().rect.color, kHeld);
    EXPECT_TRUE(release(button, {703, 1898}));
    EXPECT_EQ(shown(button).front().rect.color, kWhite);
  }
  EXPECT_TRUE(press(button, {373, 1568}));
  EXPECT_TRUE(longPress(button, {373, 1568}));
  EXPECT_FALSE(press(button, {704, 1568})) << "beside it";
  EXPECT_EQ(calls, "pcpcdpl");
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[BUTTON3] pressed!!", "[BUTTON3] onTouchClickCount!! 1",
                              "[BUTTON3] released!!", "[BUTTON3] pressed!!",
                              "[BUTTON3] onTouchClickCount!! 2", "[BUTTON3] released!!",
                              "[BUTTON3] pressed!!", "[BUTTON3] long pressed!!"}));
}

TEST_F(Button3Test, AppearsLaterAndHides) {
  Button3 button(1);
  platform().ticks = 1000;
  button.onShowTimer(250);
  platform().ticks = 1249;
  EXPECT_TRUE(shown(button).empty());
  platform().ticks = 1250;
  EXPECT_EQ(shown(button).size(), 2U);
  EXPECT_TRUE(button.isActive());
  EXPECT_EQ(button.hide(), 1);
  EXPECT_FALSE(button.isActive());
}

TEST_F(Button3Test, TakesAnyScreenAndText) {
  const SKIA_Text endless = endlessText('x');
  for (const int w : kHostileSizes) {
    for (const int h : kHostileSizes) {
      setScreen(w, h);
      Button3 button(2, &endless, &endless, INT_MIN);
      const std::vector<Drawing> drawn = shown(button);
      ASSERT_EQ(drawn.size(), 3U);
      EXPECT_EQ(drawn.at(1).text.text, std::string(127, 'x'));
      EXPECT_EQ(drawn.at(2).text.text, std::string(127, 'x'));
    }
  }
  setScreen(1080, 1920);
  Button3 low(1, nullptr, INT_MIN);
  EXPECT_EQ(shown(low).front().rect.y, INT_MAX) << "as far down as a record can say";
  Button3 high(1, nullptr, INT_MAX);
  EXPECT_EQ(shown(high).front().rect.y, 1568 - INT_MAX);
}

}  // namespace
