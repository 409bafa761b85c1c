#include <MW/slide_e.h>

#include <climits>

#include "support/drawings.h"
#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using SlideETest = WidgetTest;
using SlideEPlays = PlayTest;
using MW::SlideE;

constexpr SKIA_Rect kBar = {0, 0, 600, 100, 7};  // the knob goes from 0 to 500
const SKIA_Text* const kNoText = nullptr;

Maker exitSlide(int state) { return makes<SlideE>(state, &kBar, kNoText, nullptr); }

Step knob() {
  return look<SlideE>([](SlideE& slide) {
    const auto state = slide.state;
    const std::string held = slide.isSelect() != 0 ? " held" : "";
    return std::to_string(state) + " at " + std::to_string(shown(slide).back().rect.x) + held;
  });
}

const std::vector<Play> kPlays = {
    {"ExitsAtTheRight",
     exitSlide(SlideE::kFromLeft),
     {press(99, 99), drag(499, 0), knob(), drag(1, 0), knob()},
     "+ + <0 at 499 held> exit+ <0 at 0>"},
    {"ExitsAtTheLeft",
     exitSlide(SlideE::kFromRight),
     {press(500, 0), drag(-499, 0), drag(9, 0), drag(-10, 0), knob(), drag(600, 0)},
     "+ + + exit+ <1 at 500> -"},
    {"SnapsBackWhenItIsReleased",
     exitSlide(SlideE::kFromLeft),
     {press(100, 0), press(0, 0), drag(-5, 0), drag(5, 0), knob(), release(900, 0), knob()},
     "- + + + <0 at 5 held> + <0 at 0>"},
    {"ExitsByAnyMotionToTheOtherEndAlone",
     exitSlide(4),
     {press(0, 0), drag(INT_MIN, 0), knob(), drag(INT_MAX, 0), knob()},
     "+ + <4 at 0 held> exit+ <4 at 0>"},
    {"AnotherStateNeverExits",
     exitSlide(7),
     {press(500, 0), drag(INT_MIN, 0), knob(), drag(INT_MAX, 0), knob()},
     "+ + <7 at 0 held> + <7 at 500 held>"},
    {"ASecondFingerBesideTheKnobCancelsTheDrag",
     exitSlide(SlideE::kFromLeft),
     {press(0, 0), drag(50, 0), finger(1), drag(60, 0), release(), longPress(), finger(2),
      press(300, 9), lookAtLog(), knob(), finger(0), drag(600, 0)},
     "+ + - - - + <[SLIDE_EXIT] Another touch finger pressed!\nDisabled button selection!> "
     "<0 at 0> -"},
};
TEST_P(SlideEPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, SlideEPlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(SlideETest, ItsArrowPointsToTheExit) {
  const SKIA_Text* const unused = nullptr;
  SlideE slide(SlideE::kFromRight, &kBar, nullptr, unused);
  EXPECT_EQ(places(shown(slide)).substr(0, 31), "0,0 600x100|0,0 500x100|500,0 1");
  EXPECT_EQ(shown(slide).at(3).line, (SKIA_Point{0, 0, 0, 0, MW::kColorRed, 1}));
}

}  // namespace
