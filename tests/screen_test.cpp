#include <MW/screen.h>

#include <memory>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::FullScreen;
using MW::Screen;

std::string calls;  // a letter for each callback, and where the event was
void note(char letter, const MW::mouse_event* mouse) {
  calls += letter + std::to_string(mouse->x) + ',' + std::to_string(mouse->y) + ' ';
}

// 1000 x 2000; it listens to everything but double taps.
class ScreenTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
    setScreen(1000, 2000);
    screen = std::make_unique<Screen>();
    screen->pressCallback = [](MW::mouse_event* mouse) { note('p', mouse); };
    screen->clickCallback = [](MW::mouse_event* mouse) { note('c', mouse); };
    screen->longPressCallback = [](MW::mouse_event* mouse) { note('l', mouse); };
    screen->hoverCallback = [](MW::mouse_event* mouse) { note('h', mouse); };
    platform().takeLog();
  }
  void TearDown() override {
    screen.reset();
    WidgetTest::TearDown();
  }
  void tap(Spot down, Spot up, unsigned int ms) {
    press(*screen, down);
    platform().ticks += ms;
    release(*screen, up);
  }
  // How far the last tap got: the number that it counts, 0 when it does not.
  static int counted() {
    const std::vector<LogLine> log = platform().takeLog();
    const std::string words = "[BUTTON] onTouchClickCount!! ";
    if (log.back().message.rfind(words, 0) != 0) return 0;
    return std::stoi(log.back().message.substr(words.size()));
  }
  static void countDoubleTaps(Screen& of) {
    of.doubleClickCallback = [](int value) { calls += value == 0 ? "d" : "!"; };
  }

  std::unique_ptr<Screen> screen;
};

TEST_F(ScreenTest, ReportsEveryTouchWhereverItIs) {
  EXPECT_TRUE(press(*screen, {-5, 9000}, 2));
  EXPECT_EQ(screen->isSelect(), 3);
  EXPECT_TRUE(drag(*screen, {1, 2}));
  EXPECT_TRUE(longPress(*screen, {3, 4}));
  EXPECT_TRUE(release(*screen, {5, 6}, 7));
  EXPECT_EQ(screen->isSelect(), 0);
  EXPECT_EQ(calls, "p-5,9000 h1,2 l3,4 c5,6 ");
  EXPECT_TRUE(shown(*screen).empty());
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, {"[BUTTON] pressed!!"}));
  for (int code = 4; code <= 8; ++code) EXPECT_FALSE(offer(*screen, {.type = code, .mouse = {}}));
  EXPECT_FALSE(screen->onRecvEvent(nullptr, 0));
}

TEST_F(ScreenTest, ABitOfItsVariantPassesEventsOn) {
  for (const int variant : {0, 1, 2, 3, 4, 6}) {
    screen->setButtonType(variant);
    const bool taken = variant == 0 || variant == 1 || variant == 4;
    for (const auto code :
         {MW::kEventMotion, MW::kEventPress, MW::kEventRelease, MW::kEventLongPress}) {
      calls.clear();
      EXPECT_EQ(offer(*screen, pointerEvent(code, {1, 1})), taken) << variant;
      EXPECT_FALSE(calls.empty()) << "told all the same";
    }
  }
}

struct SquareCase : Row {
  Spot down, up;
  bool counts;
};

class ScreenSquare : public ScreenTest, public testing::WithParamInterface<SquareCase> {};

TEST_P(ScreenSquare, SaysWhetherATapCounts) {
  countDoubleTaps(*screen);
  platform().ticks = 1000;
  tap(GetParam().down, GetParam().up, 10);
  EXPECT_EQ(counted(), GetParam().counts ? 1 : 0);
}

INSTANTIATE_TEST_SUITE_P(
    Places, ScreenSquare,
    testing::Values(SquareCase{{"Still"}, {500, 500}, {500, 500}, true},
                    SquareCase{{"TopLeftIn"}, {500, 500}, {475, 475}, true},
                    SquareCase{{"LeftOut"}, {500, 500}, {474, 500}, false},
                    SquareCase{{"BottomRightIn"}, {500, 500}, {524, 524}, true},
                    SquareCase{{"BottomOut"}, {500, 500}, {500, 525}, false},
                    SquareCase{{"AtTheNearEdges"}, {50, 50}, {50, 50}, true},
                    SquareCase{{"TooFarLeft"}, {49, 500}, {49, 500}, false},
                    SquareCase{{"TooFarUp"}, {500, 49}, {500, 49}, false},
                    SquareCase{{"AtTheFarEdges"}, {950, 1950}, {950, 1950}, true},
                    SquareCase{{"TooFarRight"}, {951, 500}, {951, 500}, false},
                    SquareCase{{"TooFarDown"}, {500, 1951}, {500, 1951}, false},
                    SquareCase{{"OffTheScreen"}, {INT_MIN, INT_MAX}, {INT_MIN, INT_MAX}, false}),
    rowName);

struct TapTime {
  unsigned int pressed, released;
  Spot spot = {500, 500};
};

struct TapCase : Row {
  std::vector<TapTime> taps;
  std::vector<int> counts;  // of each tap
};

class ScreenDoubleTap : public ScreenTest, public testing::WithParamInterface<TapCase> {};

TEST_P(ScreenDoubleTap, GoesByTheClock) {
  countDoubleTaps(*screen);
  screen->pressCallback = screen->clickCallback = nullptr;
  std::vector<int> counts;
  std::string doubles;
  for (const TapTime& each : GetParam().taps) {
    platform().ticks = each.pressed;
    tap(each.spot, each.spot, each.released - each.pressed);
    counts.push_back(counted());
    if (counts.back() == 2) doubles += 'd';
  }
  EXPECT_EQ(counts, GetParam().counts);
  EXPECT_EQ(calls, doubles);
}

INSTANTIATE_TEST_SUITE_P(
    Times, ScreenDoubleTap,
    testing::Values(
        TapCase{{"Three"}, {{1000, 1100}, {1200, 1300}, {1400, 1500}}, {1, 2, 3}},
        TapCase{{"FarApart"}, {{1000, 1100}, {1200, 1300, {60, 1900}}}, {1, 2}},
        TapCase{{"Held499"}, {{1000, 1499}, {1600, 1700}}, {1, 2}},
        TapCase{{"Held500"}, {{1000, 1500}, {1600, 1700}}, {0, 1}},
        TapCase{{"SecondReleased499"}, {{1000, 1100}, {1200, 1599}}, {1, 2}},
        TapCase{{"SecondReleased500"}, {{1000, 1100}, {1200, 1600}}, {1, 0}},
        TapCase{{"SecondPressed501"}, {{1000, 1100}, {1601, 1650}}, {1, 1}},
        TapCase{{"EdgeBetween"}, {{1000, 1100}, {1200, 1250, {10, 10}}, {1300, 1400}}, {1, 0, 2}},
        TapCase{
            {"BehindTheWrap"}, {{0xFFFFFFF0, 0xFFFFFFF8}, {1000, 1100}, {1200, 1300}}, {0, 1, 2}}),
    rowName);

TEST_F(ScreenTest, TakesAnyScreen) {
  for (const int size : kHostileSizes) {
    setScreen(size, size);
    Screen any;
    countDoubleTaps(any);
    platform().ticks = 1000;
    for (const Spot spot : {Spot{60, 60}, {INT_MAX, INT_MAX}, {INT_MIN, INT_MIN}}) {
      platform().takeLog();
      press(any, spot);
      release(any, spot);
      any.setRect(0, nullptr);
      const bool isLarge = size == INT_MAX || size == 0;  // the default size
      EXPECT_EQ(counted(), isLarge && spot.x == 60 ? 1 : 0) << size << ' ' << spot.x;
    }
  }
}

struct FillCase : Row {
  int w, h, number;
  SKIA_Rect fill;
};

class FullScreenFill : public WidgetTest, public testing::WithParamInterface<FillCase> {};

TEST_P(FullScreenFill, CoversTheScreen) {
  setScreen(GetParam().w, GetParam().h);
  FullScreen fill(GetParam().number);
  EXPECT_EQ(fill.type(), 0);
  EXPECT_FALSE(fill.isActive());
  EXPECT_EQ(shown(fill), (std::vector{box(GetParam().fill)}));
  fill.show();
  EXPECT_EQ(platform().takeDrawings(), (std::vector{box(GetParam().fill)}));
}

INSTANTIATE_TEST_SUITE_P(
    Screens, FullScreenFill,
    testing::Values(FillCase{{"White"}, 1440, 2560, 0, {0, 0, 1441, 2561, 0xFFFFFFFF}},
                    FillCase{{"Red"}, 1080, 1920, 1, {0, 0, 1081, 1921, 0xFFFF0000}},
                    FillCase{{"Green"}, 720, 1280, 2, {0, 0, 721, 1281, 0xFF00FF00}},
                    FillCase{{"Blue"}, 2560, 1440, 3, {0, 0, 2561, 1441, 0xFF0000FF}},
                    FillCase{{"Grey"}, 1081, 1921, 4, {0, 0, 1082, 1922, 0xFFBFBFBF}},
                    FillCase{{"Seven"}, 1080, 1920, 7, {0, 0, 1081, 1921, 0xFFBFBFBF}},
                    FillCase{{"Negative"}, 1080, 1920, -1, {0, 0, 1081, 1921, 0xFFBFBFBF}},
                    FillCase{{"DefaultSize"}, 0, 0, INT_MIN, {0, 0, 1441, 2561, 0xFFBFBFBF}},
                    FillCase{
                        {"Huge"}, INT_MAX, INT_MIN, 0, {0, 0, INT_MAX, INT_MIN + 1, 0xFFFFFFFF}}),
    rowName);

struct OpenFullScreen : FullScreen {
  using FullScreen::FullScreen;
  using FullScreen::lcdState;
};

TEST_F(ScreenTest, AFilledScreenTakesNothingAndKnowsItsPanel) {
  OpenFullScreen fill(0);
  fill.setActive(1);
  EXPECT_FALSE(press(fill, {1, 1}));
  EXPECT_EQ(fill.lcdState, 1);
  fill.lcdOn(0);
  EXPECT_EQ(fill.lcdState, 0);
  EXPECT_EQ(fill.hide(), 1);
  EXPECT_EQ(fill.lcdState, 1);
  EXPECT_FALSE(fill.isActive());
  setScreen(50, 60);
  fill.setRect(2);
  EXPECT_EQ(shown(fill), (std::vector{box({0, 0, 51, 61, 0xFF00FF00})}));
}

}  // namespace
