#include <MW/button.h>

#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Widget;

constexpr SKIA_Rect kArea = {100, 200, 300, 80, 0xFF202020};
const SKIA_Text kCaption = textRecord("Start", 0xFFFFFFFF, 5, 48);
const PlaysOn kButton = {makes<MW::Button, Told::Zero>(&kArea, &kCaption)};

Step face() {
  return look([](Widget& button) {
    const bool isLit = button.getBgColor() == MW::kColorHighlight;
    return std::to_string(button.isSelect()) + (isLit ? " lit" : " plain");
  });
}

// The drawing calls of show() without a time.
Step untimed() {
  return look([](Widget& button) {
    platform().takeDrawings();
    button.show();
    return platform().takeDrawings().size();
  });
}

const PlayTests kPlays = {
    kButton("IsClickedByAReleaseInside", {press(100, 279), face(), release(), face(), lookAtLog()},
            "press+ <1 lit> click+ <0 plain> <[BUTTON] released!!>"),
    kButton("StaysPlainWhenTheFingerComesBackAndIsNotClickedOutside",
            {press(100, 279), moveTo(399, 279), face(), moveTo(400, 279), moveTo(100, 200), face(),
             release(400, 279), face()},
            "press+ + <1 lit> + + <1 plain> + <0 plain>"),
    kButton("IgnoresWhatBeginsOutsideButAReleaseInside",
            {press(99, 240), longPress(), release(), moveTo(100, 279), release()},
            "- - - - click+"),
    kButton("FollowsEveryFingerWhileHeld",
            {finger(2), press(100, 279), face(), finger(0), press(400, 240), face(), finger(5),
             release(), face(), release()},
            "press+ <3 lit> press+ <1 lit> + <0 plain> -"),
    kButton("IsReleasedByALongPress",
            {press(100, 279), longPress(), lookAtLog(), face(), moveTo(101, 279), lookAtRedraw()},
            "press+ long+ <[BUTTON] long pressed!!> <0 plain> - <still>"),
    PlaysOn{without(&Widget::longPressCallback, kButton.make)}(
        "StaysHeldWithoutALongPressCallback",
        {press(100, 279), longPress(400, 240), face(), keyDown(5), release(100, 279)},
        "press+ + <1 lit> - click+"),
    PlaysOn{without(&Widget::doubleClickCallback, kButton.make)}(
        "CountsClicksWhileADoubleClickIsWanted",
        {press(100, 279), release(),
         call([](Widget& button) { button.doubleClickCallback = [](int) { note("double"); }; }),
         press(), release(), press(), release(), press(), release()},
        "press+ click+ press+ click+ press+ click double+ press+ click+"),
    kButton("IsFreedByHiding", {press(100, 279), call(&Widget::hide), face(), moveTo(101, 279)},
            "press+ <0 plain> -"),
    kButton("AsksForARedrawWhenItsColourComesBack",
            {call(&Widget::restoreColor), lookAtRedraw(), press(100, 279),
             call(&Widget::restoreColor), lookAtRedraw(), face()},
            "<still> press+ <redraw> <1 plain>"),
    kButton("IsNeitherSeenNorTouchedUntilItsDelayedShow",
            {call(&Widget::setActive, 0), call(&Widget::onShowTimer, 250), look(&Widget::isActive),
             lookAtRedraw(), later(249), timer(), lookAtRedraw(), lookAtDrawings(), later(1),
             press(100, 279), timer(), lookAtRedraw(), lookAtDrawings(), press()},
            "<1> <redraw> <still> <0> - <redraw> <1> press+"),
    kButton("IsSeenAfterItsDelayOverTheWrapAndNeverWithoutATime",
            {at(~15U), call(&Widget::onShowTimer, 250), later(249), lookAtDrawings(), later(1),
             untimed(), lookAtDrawings(), untimed()},
            "<0> <0> <1> <1>"),
    kButton("IsSeenAfterADelayThatStartsWithTheClock",
            {at(0), call(&Widget::onShowTimer, 250), lookAtDrawings(), at(249), lookAtDrawings(),
             at(250), lookAtDrawings()},
            "<0> <0> <1>"),
};

TEST_F(WidgetTest, AButtonsCaptionChangesItsLooks) {
  MW::Button button(&kArea, &kCaption);
  button.setFontSize(33);
  button.setTextColor(7);
  EXPECT_EQ(shown(button).at(0).text, (DrawnText{"Start", 7, 5, 33}));
  EXPECT_EQ(std::pair(button.getFontSize(), button.getTextColor()), std::pair(33, 7U));
}

}  // namespace
