#include <MW/slide_move.h>

#include <climits>

#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using SlideMoveTest = WidgetTest;
using MW::SlideMove;

constexpr SKIA_Rect kBar = {0, 0, 600, 100, 7};

PlaysOn slide(int percent, int a, int b, int initial) {
  return {makes<SlideMove>(&kBar, percent, a, b, initial)};
}

Step value() {
  return look<SlideMove>([](SlideMove& slide) {
    const std::string left = std::to_string(shown(slide).back().rect.x);
    return std::to_string(slide.getValue()) + " at " + left;
  });
}

const PlayTests kPlays = {
    slide(SlideMove::kValueKnob, 0, 100, 50)(
        "TruncatesToTheValueAtTheKnob",
        {value(), press(240, 9), drag(239, 0), value(), drag(1, 0), value(), release(), drag(-9, 0),
         value()},
        "<50 at 240> + + <99 at 479> + <100 at 480> + - <100 at 480>"),
    slide(80, 0, 200, 80)(
        "ReadsNoMoreThanAHundred",
        {press(120, 9), drag(29, 0), value(), drag(1, 0), value(), drag(900, 0), value()},
        "+ + <99 at 149> + <100 at 150> + <100 at 300>"),
    slide(51, 10, 10, 5)("EqualBoundsAreZeroToOne", {value()}, "<10 at 3000>"),
    slide(50, 100, 0, 50)("TheHigherBoundFirstMakesEveryStartABound",
                          {value(), press(0, 0), drag(-9, 0), drag(150, 0), value()},
                          "<0 at 0> + + + <50 at 150>"),
    slide(50, 100, 0, 0)("TheHigherBoundFirstMakesTheLowerOneItself", {value()}, "<0 at 0>"),
    slide(50, 150, 250, 0)("StartsAtTheLowerBound", {value()}, "<150 at 0>"),
    slide(20, 0, 100, 100)(
        "StaysWhereTheDragIsCancelled",
        {press(480, 0), lookAtLog(), drag(-48, 0), finger(3), press(0, 0), value()},
        "+ <[SLIDE] pressed!!: 0> + + <90 at 432>"),
    slide(20, 0, 100, 0)("LockingChangesNothing",
                         {call(&MW::Widget::Lock), press(0, 0), drag(48, 0), value()},
                         "+ + <10 at 48>"),
    slide(20, INT_MIN, INT_MAX, 0)(
        "TakesTheWidestRange",
        {press(240, 0), drag(INT_MAX, 0), value(), drag(INT_MIN, 0), value()},
        "+ + <100 at 480> + <-2147483648 at 0>"),
};

struct Open : SlideMove {
  using SlideMove::fill;
  using SlideMove::SlideMove;
};

TEST_F(SlideMoveTest, TheFillIsLaidOutUpToAKnob) {
  Open slide(&kBar, 20, 0, 100, 0);
  const SKIA_Rect knob = {100, 0, 120, 100, 0};
  slide.setRect_Slide(&knob);
  EXPECT_EQ(slide.fill, (SKIA_Rect{0, 10, 103, 80, MW::kColorRed}));
  slide.setRect_Slide(nullptr);
  EXPECT_EQ(slide.fill.w, 103);
}

TEST_F(SlideMoveTest, AKnobWithoutRoomKeepsItsValue) {
  for (const int width : {0, -1, INT_MIN}) {
    const SKIA_Rect area = {0, 0, width, 100, 0};
    SlideMove slide(&area, 20, 0, 100, 50);
    slide.setMove2Value(9);
    EXPECT_EQ(slide.getValue(), 50);
    EXPECT_EQ(slide.setValue2Move(UINT_MAX), 0);
  }
}

}  // namespace
