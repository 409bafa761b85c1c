#include <MW/slide.h>

#include <memory>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Slide;
using MW::SlideV;

constexpr unsigned int kWhite = 0xFFFFFFFF;
constexpr SKIA_Rect kArea = {10, 20, 503, 61, 0xFF123456};  // units of 100, height 60
constexpr SKIA_Rect kTrack = {10, 20, 500, 60, 0xFF000000};
constexpr SKIA_Rect kLeft = {10, 20, 200, 60, kWhite};
constexpr SKIA_Rect kRight = {310, 20, 200, 60, kWhite};
const SKIA_Text kCaption = textRecord("Wi-Fi", 0xFF111111, 5, 40);
const SKIA_Text kSecond = textRecord("slow", 0xFF222222, 1, 30);
const DrawnText kCaptionDrawn = {"Wi-Fi", 0xFF111111, 5, 40};
const DrawnText kOn = {"ON", 0xFF00FF00, 5, 80};
const DrawnText kOff = {"OFF", 0xFF787878, 5, 80};

std::string calls;
std::unique_ptr<Slide> slide;

class SlideTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
    platform().ticks = 10000;
  }
  void TearDown() override {
    slide.reset();
    WidgetTest::TearDown();
  }
  static void make(int state) {
    slide = std::make_unique<Slide>(state, &kArea, &kCaption, nullptr);
    slide->leftCallback = [](int value) {
      calls += value == 0 && slide->state % 2 == 0 ? 'l' : '!';
    };
    slide->rightCallback = [](int value) {
      calls += value == 0 && slide->state % 2 == 1 ? 'r' : '!';
    };
    slide->doubleClickCallback = [](MW::mouse_event* mouse) {
      calls += mouse->state == 1 && mouse->x == 15 ? 'd' : '!';
    };
    platform().takeLog();
  }
  static bool move(int by, unsigned int finger = 0) {
    return offer(*slide, {.type = MW::kEventMotion, .mouse = {0, finger, 0, 0, by, 0}});
  }
  static int knobX() { return shown(*slide).at(3).rect.x; }
};

TEST_F(SlideTest, KnobStandsWhereItsStateSays) {
  for (const int state : {0, 1, 2, 3, 4, 5, -1, INT_MIN}) {
    make(state);
    const SKIA_Rect knob = state == 1 || state == 3 ? kRight : kLeft;
    EXPECT_EQ(shown(*slide), (std::vector{box(kTrack), label(kLeft, kOn), label(kRight, kOff),
                                          box(knob), label(knob, kCaptionDrawn)}))
        << state;
  }
}

TEST_F(SlideTest, TwoCaptionsShareTheKnob) {
  const Drawing upper = label({310, 20, 200, 30, kWhite}, kCaptionDrawn);
  const Drawing lower = label({310, 50, 200, 30, kWhite}, {"slow", 0xFF222222, 1, 30});
  slide = std::make_unique<Slide>(1, &kArea, &kCaption, &kSecond);
  EXPECT_EQ(shown(*slide), (std::vector{box(kTrack), label(kLeft, kOn), label(kRight, kOff),
                                        box(kRight), upper, lower}));
  slide->Lock();
  EXPECT_EQ(shown(*slide),
            (std::vector{box(kRight), upper, lower, box({310, 20, 200, 60, 0x7F000000})}));
  slide->unLock();
  EXPECT_EQ(shown(*slide).size(), 6U);
}

TEST_F(SlideTest, ThePlainOneCoversItsTrackAtTheLeft) {
  SlideV plain(0, &kArea, &kCaption, nullptr);
  const SKIA_Rect whole = {10, 20, 500, 60, kWhite};
  EXPECT_EQ(shown(plain), (std::vector{box(kTrack), box(whole), label(whole, kCaptionDrawn)}));
  EXPECT_TRUE(press(plain, {509, 79}));
  offer(plain, {.type = MW::kEventMotion, .mouse = {0, 0, 0, 0, 299, 0}});
  EXPECT_EQ(plain.state, 1);
  EXPECT_EQ(shown(plain), (std::vector{box(kTrack), box(kRight), label(kRight, kCaptionDrawn)}));
}

struct SecondCase : Row {
  SKIA_Text given;
  std::string drawn;
};

SKIA_Text withLength(SKIA_Text record, int length) {
  record.string_len = length;
  return record;
}

SKIA_Text withSize(SKIA_Text record, int size) {
  record.size = size;
  return record;
}

class SlideSecond : public SlideTest, public testing::WithParamInterface<SecondCase> {};

// Its size field counts the bytes that are copied, its length the bytes that are drawn.
TEST_P(SlideSecond, CaptionIsCutByItsSize) {
  Slide both(0, &kArea, nullptr, &GetParam().given);
  EXPECT_EQ(shown(both).at(4).text, DrawnText{});
  EXPECT_EQ(shown(both).at(5).text.text, GetParam().drawn);
}

INSTANTIATE_TEST_SUITE_P(
    Sizes, SlideSecond,
    testing::Values(
        SecondCase{{"LargeEnough"}, textRecord("LOCKED", 0, 0, 6), "LOCKED"},
        SecondCase{{"Small"}, textRecord("LOCKED", 0, 0, 3), "LOC" + nuls(3)},
        SecondCase{{"None"}, textRecord("LOCKED"), nuls(6)},
        SecondCase{{"Negative"}, textRecord("LOCKED", 0, 0, INT_MIN), nuls(6)},
        SecondCase{{"ItsOwnLength"}, withLength(textRecord("LOCKED", 0, 0, 80), 4), "LOCK"},
        SecondCase{{"NegativeLength"}, withLength(textRecord("LOCKED", 0, 0, 80), -1), ""},
        SecondCase{{"Endless"}, withSize(endlessText('x'), INT_MAX), std::string(127, 'x')},
        SecondCase{{"WholeCharacters"}, textRecord("\u00e4\u00f6", 0, 0, 3), "\u00e4" + nuls(2)}),
    rowName);

struct DragCase : Row {
  int start;
  std::vector<int> moves;
  int end;            // state
  const char* calls;  // so far
  int x;              // of the knob
};

class SlideDrag : public SlideTest, public testing::WithParamInterface<DragCase> {};

TEST_P(SlideDrag, ChangesAtItsThreshold) {
  make(GetParam().start);
  const bool isRight = GetParam().start == 1 || GetParam().start == 3;
  EXPECT_TRUE(press(*slide, {isRight ? 310 : 10, 20}));
  EXPECT_EQ(slide->isSelect(), 1);
  EXPECT_EQ(slide->getOwnerFinger(), 0);
  for (const int by : GetParam().moves) EXPECT_TRUE(move(by));
  EXPECT_EQ(slide->state, GetParam().end);
  EXPECT_EQ(calls, GetParam().calls);
  const bool isHeld = calls.empty();
  EXPECT_EQ(slide->isSelect(), isHeld ? 1 : 0);
  EXPECT_EQ(slide->getOwnerFinger(), isHeld ? 0 : -1);
  EXPECT_EQ(knobX(), GetParam().x);
  EXPECT_EQ(shown(*slide).at(4).rect.x, GetParam().x) << "the caption goes with it";
  EXPECT_EQ(move(1), isHeld) << "it must be pressed again";
}

INSTANTIATE_TEST_SUITE_P(Moves, SlideDrag,
                         testing::Values(DragCase{{"FullBeforeTheEnd"}, 0, {298}, 0, "", 308},
                                         DragCase{{"FullAtTheEnd"}, 0, {298, 1}, 1, "r", 310},
                                         DragCase{{"FullBeyond"}, 0, {INT_MAX}, 1, "r", 310},
                                         DragCase{{"FullToTheWall"}, 0, {-50, 20}, 0, "", 30},
                                         DragCase{{"FullBackBefore"}, 1, {-299}, 1, "", 11},
                                         DragCase{{"FullBack"}, 1, {-299, -1}, 0, "l", 10},
                                         DragCase{{"FullStaysRight"}, 1, {5}, 1, "", 309},
                                         DragCase{{"HalfBefore"}, 2, {199}, 2, "", 209},
                                         DragCase{{"HalfNear"}, 2, {199, 1}, 3, "r", 310},
                                         DragCase{{"HalfBeyond"}, 2, {INT_MAX}, 3, "r", 310},
                                         DragCase{{"HalfBackBefore"}, 3, {-199}, 3, "", 111},
                                         DragCase{{"HalfBack"}, 3, {-199, -1}, 2, "l", 10},
                                         DragCase{{"HalfFarBack"}, 3, {INT_MIN}, 2, "l", 10},
                                         DragCase{{"NoSuchState"}, 5, {400}, 5, "", 309}),
                         rowName);

TEST_F(SlideTest, FollowsItsOwnFingerAlone) {
  make(0);
  EXPECT_FALSE(press(*slide, {210, 20})) << "beside the knob";
  EXPECT_FALSE(move(5));
  EXPECT_TRUE(press(*slide, {209, 79}, 1));
  EXPECT_FALSE(move(50, 0));
  EXPECT_FALSE(release(*slide, {15, 25}, 0));
  EXPECT_TRUE(move(50, 1));
  EXPECT_FALSE(longPress(*slide, {15, 25}, 1));
  EXPECT_FALSE(offer(*slide, keyEvent(MW::kEventKeyPress, 1)));
  EXPECT_EQ(knobX(), 60);
  EXPECT_TRUE(release(*slide, {999, 999}, 1));
  EXPECT_EQ(knobX(), 10);
  EXPECT_EQ(slide->isSelect(), 0);
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[SLIDE] pressed!!: 1", "[SLIDE] released!!:1"}));
  EXPECT_FALSE(slide->onRecvEvent(nullptr, 0));
}

TEST_F(SlideTest, AnotherFingerElsewhereCancelsTheDrag) {
  make(0);
  press(*slide, {15, 25});
  move(100);
  EXPECT_TRUE(press(*slide, {900, 900}, 1));
  EXPECT_EQ(slide->isSelect(), 0);
  EXPECT_EQ(slide->getOwnerFinger(), -1);
  EXPECT_EQ(knobX(), 10);
  EXPECT_FALSE(press(*slide, {900, 900}, 1)) << "nothing left to cancel";
  EXPECT_EQ(calls, "");
}

TEST_F(SlideTest, LockedItCountsTapsInsteadOfMoving) {
  make(0);
  press(*slide, {15, 25});
  release(*slide, {15, 25});
  slide->Lock();
  platform().takeLog();
  EXPECT_TRUE(press(*slide, {15, 25}));
  EXPECT_TRUE(move(299));
  EXPECT_EQ(slide->state, 0);
  EXPECT_EQ(shown(*slide).front().rect, kLeft);
  EXPECT_TRUE(release(*slide, {15, 25}));
  for (int i = 0; i < 2; ++i) {
    press(*slide, {15, 25});
    platform().ticks += 499;
    release(*slide, {15, 25});
  }
  EXPECT_EQ(calls, "d") << "the second of three";
  EXPECT_EQ(platform().takeLog().back().message, "[SLIDE] onTouchClickCount!! 3");
  press(*slide, {15, 25});
  platform().ticks += 500;
  release(*slide, {15, 25});
  press(*slide, {15, 25});
  release(*slide, {999, 25});
  EXPECT_EQ(platform().takeLog().back().message, "[SLIDE] released!!:0") << "late, and outside";
}

TEST_F(SlideTest, HideLetsTheFingerBe) {
  make(0);
  slide->setActive(1);
  press(*slide, {15, 25});
  EXPECT_EQ(slide->hide(), 1);
  EXPECT_FALSE(slide->isActive());
  EXPECT_EQ(slide->isSelect(), 1);
}

// Drags it as far as can be, there and back.
void swing(Slide& any) {
  for (const int by : {INT_MIN, INT_MAX}) any.onHover(MW::mouse_event{0, 0, 0, 0, by, 0});
}

TEST_F(SlideTest, TakesAnyArea) {
  for (const int x : kHostileSizes) {
    for (const int w : kHostileSizes) {
      const SKIA_Rect area = {x, x, w, w, 0};
      Slide any(2, &area, nullptr, nullptr);
      SlideV plain(3, &area, nullptr, nullptr);
      EXPECT_EQ(shown(any).at(3).rect.x, x);
      swing(any);
      swing(plain);
      EXPECT_EQ(any.state, 3) << x << ' ' << w;
      EXPECT_EQ(plain.state, 3) << x << ' ' << w;
    }
  }
  Slide nowhere(0, nullptr, nullptr, nullptr);
  EXPECT_EQ(shown(nowhere).at(0).rect, (SKIA_Rect{0, 0, 0, 0, 0xFF000000}));
}

}  // namespace
