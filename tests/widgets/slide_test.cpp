#include <MW/slide.h>

#include <algorithm>
#include <climits>

#include "support/drawings.h"
#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using SlideTest = WidgetTest;
using SlidePlays = PlayTest;
using MW::Slide;

constexpr SKIA_Rect kArea = {10, 20, 503, 100, 0};  // the knob, 200 wide, goes from 10 to 310
const SKIA_Text kCaption = textRecord("Wi-Fi");

template <typename Kind = Slide>
Maker slide(int state) {
  return [state] {
    auto made = heard(std::make_unique<Kind>(state, &kArea, &kCaption, nullptr));
    made->doubleClickCallback = [](MW::mouse_event* mouse) {
      noteTouch("double" + std::to_string(mouse->state), mouse);
    };
    made->setActive(1);
    return made;
  };
}

// The state, the place of the caption, which goes with the knob, and whether it is held.
Step knob() {
  return look<Slide>([](Slide& slide) {
    const auto state = slide.state;
    const int left = placeOf(shown(slide), "Wi-Fi").x;
    const std::string held = slide.isSelect() != 0 ? " held" : "";
    return std::to_string(state) + " at " + std::to_string(left) + held;
  });
}

const std::vector<Play> kPlays = {
    {"FullTravelSwitchesOnAtTheEnd",
     slide(Slide::kFullLeft),
     {press(209, 79), knob(), drag(298, 0), knob(), drag(1, 0), knob(), drag(1, 0)},
     "+ <0 at 10 held> + <0 at 308 held> right+ <1 at 310> -"},
    {"FullTravelSwitchesOffAtTheEnd",
     slide(Slide::kFullRight),
     {press(310, 20), drag(-299, 0), knob(), drag(-1, 0), knob()},
     "+ + <1 at 11 held> left+ <0 at 10>"},
    {"HalfTravelSwitchesOnAUnitBefore",
     slide(Slide::kHalfLeft),
     {press(10, 20), drag(199, 0), knob(), drag(1, 0), knob()},
     "+ + <2 at 209 held> right+ <3 at 310>"},
    {"HalfTravelSwitchesOffAUnitBefore",
     slide(Slide::kHalfRight),
     {press(310, 20), drag(-199, 0), knob(), drag(-1, 0), knob()},
     "+ + <3 at 111 held> left+ <2 at 10>"},
    {"SwitchesOnceByAnyMotion",
     slide(Slide::kHalfRight),
     {press(310, 20), drag(INT_MIN, 0), knob(), press(10, 20), drag(INT_MAX, 0), knob()},
     "+ left+ <2 at 10> + right+ <3 at 310>"},
    {"AnotherStateDoesNotChange",
     slide(5),
     {press(10, 20), drag(-50, 0), drag(20, 0), knob(), drag(400, 0), knob()},
     "+ + + <5 at 30 held> + <5 at 309 held>"},
    {"FollowsTheFingerThatTookItOver",
     slide(Slide::kFullLeft),
     {press(210, 20), drag(5, 0), finger(1), press(209, 79), finger(0), drag(50, 0),
      release(15, 25), finger(1), drag(50, 0), knob(), longPress(), release(999, 999), lookAtLog(),
      knob()},
     "- - + - - + <0 at 60 held> - + <[SLIDE] released!!:1> <0 at 10>"},
    {"APressBesideTheKnobLetsItSnapBack",
     slide(Slide::kFullRight),
     {press(315, 25), lookAtLog(), drag(-100, 0), finger(1), press(900, 900), knob()},
     "+ <[SLIDE] pressed!!: 0> + + <1 at 310>"},
    {"IsFollowedWhenHiddenWhileHeld",
     slide(Slide::kFullLeft),
     {press(10, 20), call(&MW::Widget::hide), drag(300, 0), knob(), look(&MW::Widget::isActive)},
     "+ right+ <1 at 310> <0>"},
    {"LockedItDoesNotMoveAndTellsDoubleTaps",
     slide(Slide::kFullLeft),
     {call(&MW::Widget::Lock), press(15, 25), drag(299, 0), knob(), release(), press(), release(),
      press(), release()},
     "+ + <0 at 10 held> + + double1+ + +"},
    {"LockedItCountsNoTapThatEndsBesideTheKnob",
     slide(Slide::kFullLeft),
     {call(&MW::Widget::Lock), press(15, 25), release(999, 25), press(15, 25), release(), press(),
      later(500), release(), press(), release()},
     "+ + + + + + + +"},
    {"WithoutLegendsTheKnobCoversTheAreaAtTheLeft",
     slide<MW::SlideV>(Slide::kFullLeft),
     {press(512, 119), drag(299, 0), knob(),
      look([](MW::Widget& plain) { return places(shown(plain)); })},
     "+ right+ <1 at 310> <10,20 500x100|310,20 200x100|310,20 200x100|>"},
};
TEST_P(SlidePlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, SlidePlays, testing::ValuesIn(kPlays), kRowName);

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

TEST_F(SlideTest, ALockedSwitchShowsItsDimmedKnobAlone) {
  Slide slide(Slide::kFullRight, &kArea, &kCaption, &kCaption);
  slide.Lock();
  EXPECT_EQ(places(shown(slide)), "310,20 200x100|310,20 200x50|310,70 200x50|310,20 200x100|");
  EXPECT_EQ(shown(slide).back().rect.color, MW::kColorShadow);
}

}  // namespace
