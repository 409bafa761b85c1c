#include <MW/slide_e.h>

#include <climits>

#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::SlideE;

constexpr SKIA_Rect kBar = {0, 0, 600, 100, 7};  // the knob goes from 0 to 500
const SKIA_Text* const kNoText = nullptr;

PlaysOn from(int state) { return {makes<SlideE>(state, &kBar, kNoText, nullptr)}; }
const PlaysOn kLeft = from(SlideE::kFromLeft);

Step knob() {
  return look<SlideE>([](SlideE& slide) {
    const auto state = slide.state;
    const std::string left = std::to_string(shown(slide).back().rect.x);
    return std::to_string(state) + " at " + left + (slide.isSelect() != 0 ? " held" : "");
  });
}

const PlayTests kPlays = {
    kLeft("ExitsAtTheRight", {press(99, 99), drag(499, 0), knob(), drag(1, 0), knob()},
          "+ + <0 at 499 held> exit+ <0 at 0>"),
    from(SlideE::kFromRight)(
        "ExitsAtTheLeft",
        {press(500, 0), drag(-499, 0), drag(9, 0), drag(-10, 0), knob(), drag(600, 0)},
        "+ + + exit+ <1 at 500> -"),
    from(2)("SnapsBackWhenItIsReleased",
            {press(0, 0), drag(-5, 0), drag(5, 0), knob(), release(900, 0), press(0, 0), knob()},
            "+ + + <2 at 5 held> + + <2 at 0 held>"),
    from(4)("ExitsByAnyMotionToTheOtherEndAlone",
            {press(0, 0), drag(INT_MIN, 0), knob(), drag(INT_MAX, 0)}, "+ + <4 at 0 held> exit+"),
    from(7)("AnotherStateNeverExits",
            {press(500, 0), drag(INT_MIN, 0), knob(), drag(INT_MAX, 0), knob()},
            "+ + <7 at 0 held> + <7 at 500 held>"),
    kLeft("InitStartsOver",
          {call<SlideE>(&SlideE::SlideE_init, SlideE::kFromRight, &kBar, kNoText, ""), knob(),
           look(&MW::Widget::isActive)},
          "<1 at 500> <0>"),
    kLeft(
        "ASecondFingerBesideTheKnobCancelsTheDrag",
        {press(0, 0), drag(50, 0), finger(2), press(300, 9), lookAtLog(), knob()},
        "+ + + <[SLIDE_EXIT] Another touch finger pressed!\nDisabled button selection!> <0 at 0>"),
};

}  // namespace
