#include <MW/slide.h>

#include <algorithm>
#include <climits>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using SlideTest = WidgetTest;
using MW::Slide;

constexpr SKIA_Rect kArea = {10, 20, 503, 100, 0};  // the knob, 200 wide, goes from 10 to 310
const SKIA_Text kCaption = textRecord("Wi-Fi");

template <typename Kind = Slide>
PlaysOn slide(int state) {
  return {[state] {
    auto made = heard(std::make_unique<Kind>(state, &kArea, &kCaption, nullptr));
    made->doubleClickCallback = [](MW::mouse_event* mouse) {
      noteTouch("double" + std::to_string(mouse->state), mouse);
    };
    made->setActive(1);
    return made;
  }};
}
const PlaysOn kFullOff = slide(Slide::kFullLeft);
const PlaysOn kHalfOn = slide(Slide::kHalfRight);

// The state, the place of the caption, which goes with the knob, and whether it is held.
Step knob() {
  return look<Slide>([](Slide& slide) {
    const auto state = slide.state;
    const std::string left = std::to_string(placeOf(shown(slide), "Wi-Fi").x);
    return std::to_string(state) + " at " + left + (slide.isSelect() != 0 ? " held" : "");
  });
}

const PlayTests kPlays = {
    kFullOff("FullTravelSwitchesOnAtTheEnd",
             {press(209, 79), drag(298, 0), knob(), drag(1, 0), knob(), drag(1, 0)},
             "+ + <0 at 308 held> right+ <1 at 310> -"),
    slide(Slide::kFullRight)("FullTravelSwitchesOffAtTheEnd",
                             {press(310, 20), drag(-299, 0), knob(), drag(-1, 0), knob()},
                             "+ + <1 at 11 held> left+ <0 at 10>"),
    slide(Slide::kHalfLeft)("HalfTravelSwitchesOnAUnitBefore",
                            {press(10, 20), drag(199, 0), knob(), drag(1, 0), knob()},
                            "+ + <2 at 209 held> right+ <3 at 310>"),
    kHalfOn("HalfTravelSwitchesOffAUnitBefore",
            {press(310, 20), drag(-199, 0), knob(), drag(-1, 0), knob()},
            "+ + <3 at 111 held> left+ <2 at 10>"),
    kHalfOn("SwitchesOnceByAnyMotion",
            {press(310, 20), drag(INT_MIN, 0), knob(), press(10, 20), drag(INT_MAX, 0), knob()},
            "+ left+ <2 at 10> + right+ <3 at 310>"),
    slide(5)("AnotherStateDoesNotChange",
             {press(10, 20), drag(-50, 0), drag(20, 0), knob(), drag(400, 0), knob()},
             "+ + + <5 at 30 held> + <5 at 309 held>"),
    kFullOff("IsFollowedWhenHiddenWhileHeld",
             {press(10, 20), call(&MW::Widget::hide), drag(9, 0), knob(), release(), lookAtLog(),
              knob()},
             "+ + <0 at 19 held> + <[SLIDE] released!!:0> <0 at 10>"),
    kFullOff(
        "LockedItDoesNotMoveAndTellsDoubleTaps",
        {call(&MW::Widget::Lock), press(15, 25), drag(299, 0), knob(), release(), press(),
         release(), press(), release(), call(&MW::Widget::unLock), press(), drag(9, 0), knob()},
        "+ + <0 at 10 held> + + double1+ + + + + <0 at 19 held>"),
    kFullOff("IsAtHomeAsSoonAsItIsReleased",
             {press(15, 25), drag(250, 0), release(), press(15, 25)}, "+ + + +"),
    slide<MW::SlideV>(Slide::kFullLeft)("ThePlainOneCoversItsAreaAtTheLeft",
                                        {press(512, 119), drag(299, 0), knob()},
                                        "+ right+ <1 at 310>"),
};

// A second caption has its record's length, but only as many bytes as its size says.
TEST_F(SlideTest, CutsItsSecondCaptionByItsSize) {
  for (const int size : {INT_MIN, 0, 3, 6, 80}) {
    const SKIA_Text caption = textRecord("LOCKED", 0, 0, size);
    Slide slide(Slide::kFullLeft, &kArea, nullptr, &caption);
    std::string expected(6, '\0');
    std::copy_n("LOCKED", std::clamp(size, 0, 6), expected.begin());
    EXPECT_EQ(shown(slide).at(5).text.text, expected);
  }
}

}  // namespace
