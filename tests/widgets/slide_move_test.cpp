#include <MW/slide_move.h>

#include <climits>

#include "support/drawings.h"
#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using SlideMoveTest = WidgetTest;
using SlideMovePlays = PlayTest;
using MW::SlideMove;

constexpr SKIA_Rect kBar = {0, 0, 600, 100, 7};

Maker slide(int percent, int a, int b, int initial) {
  return makes<SlideMove>(&kBar, percent, a, b, initial);
}

Step value() {
  return look<SlideMove>([](SlideMove& slide) {
    const std::string held = slide.isSelect() != 0 ? " held" : "";
    return std::to_string(slide.getValue()) + " at " + std::to_string(shown(slide).back().rect.x) +
           held;
  });
}

const std::vector<Play> kPlays = {
    {"TruncatesToTheValueAtTheKnob",
     slide(SlideMove::kValueKnob, 0, 100, 50),
     {value(), press(240, 9), drag(239, 0), value(), drag(1, 0), value(), release(), value()},
     "<50 at 240> + + <99 at 479 held> + <100 at 480 held> + <100 at 480>"},
    {"ReadsNoMoreThanAHundred",
     slide(50, 0, 200, 80),
     {press(120, 9), drag(29, 0), value(), drag(1, 0), value(), drag(900, 0), value()},
     "+ + <99 at 149 held> + <100 at 150 held> + <100 at 300 held>"},
    {"ItsKnobIsHalfTheBarAtMost",
     slide(80, 0, 100, 0),
     {press(299, 9), drag(900, 0), value()},
     "+ + <100 at 300 held>"},
    {"EqualBoundsAreZeroToOne", slide(51, 10, 10, 5), {value()}, "<10 at 3000>"},
    {"TheHigherBoundFirstMakesEveryStartABound",
     slide(50, 100, 0, 50),
     {value(), press(0, 0), drag(-9, 0), drag(150, 0), value()},
     "<0 at 0> + + + <50 at 150 held>"},
    {"StartsAtTheLowerBound",
     slide(50, 150, 250, 0),
     {value(), press(0, 0), drag(0, 0), value()},
     "<150 at 0> + + <100 at 0 held>"},
    {"StaysWhereAPressBesideTheKnobCancelsTheDrag",
     slide(20, 0, 100, 100),
     {press(480, 0), lookAtLog(), drag(-48, 0), finger(3), drag(9, 0), press(0, 0), value(),
      finger(0), drag(9, 0)},
     "+ <[SLIDE] pressed!!: 0> + - + <90 at 432> -"},
    {"LockingChangesNothing",
     slide(20, 0, 100, 0),
     {call(&MW::Widget::Lock), press(0, 0), drag(48, 0), value()},
     "+ + <10 at 48 held>"},
    {"TakesTheWidestRange",
     slide(20, INT_MIN, INT_MAX, 0),
     {press(240, 0), drag(INT_MAX, 0), value(), drag(INT_MIN, 0), value()},
     "+ + <100 at 480 held> + <-2147483648 at 0 held>"},
};
TEST_P(SlideMovePlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, SlideMovePlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(SlideMoveTest, DrawsTheBarTheFillAndTheFramedKnob) {
  SlideMove slide(&kBar, SlideMove::kValueKnob, 0, 100, 50);
  EXPECT_EQ(places(shown(slide)),
            "0,0 600x100|0,10 600x80|0,10 243x80|238,-2 124x104|239,-1 122x102|240,0 120x100|");
  EXPECT_EQ(shown(slide).back().text.text, " 50 %");
  slide.setValue(UINT_MAX);
  EXPECT_EQ(shown(slide).back().text.text, " -1 %");
  EXPECT_EQ(shown(slide).back().rect.x, -4);
}

TEST_F(SlideMoveTest, SetRectSlideIsUndoneByADrawingPass) {
  SlideMove slide(&kBar, 20, 0, 100, 50);
  const std::string before = places(shown(slide));
  const SKIA_Rect knob = {17, 0, 0, 0, 0};
  slide.setRect_Slide(&knob);
  EXPECT_TRUE(platform().takeDrawings().empty());
  EXPECT_EQ(places(shown(slide)), before);
}

TEST_F(SlideMoveTest, AKnobWithoutRoomKeepsItsValue) {
  SlideMove slide(&kBar, 20, 0, 100, 50);
  for (const int width : {0, -1, INT_MIN}) {
    const SKIA_Rect area = {0, 0, width, 100, 0};
    slide.setRect(&area);
    slide.setValue(5);
    slide.setMove2Value(9);
    EXPECT_EQ(slide.getValue(), 5);
    EXPECT_EQ(slide.setValue2Move(UINT_MAX), 0);
  }
}

}  // namespace
