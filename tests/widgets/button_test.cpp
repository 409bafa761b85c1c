#include <MW/button.h>

#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ButtonTest = WidgetTest;
using ButtonPlays = PlayTest;
using MW::Widget;

constexpr SKIA_Rect kArea = {100, 200, 300, 80, 0xFF202020};
const SKIA_Text kCaption = textRecord("Start", 0xFFFFFFFF, 5, 48);
const Maker kButton = makes<MW::Button, Told::Zero>(&kArea, &kCaption);

Step face() {
  return look([](Widget& button) {
    const bool isLit = button.getBgColor() == MW::kColorHighlight;
    return std::to_string(button.isSelect()) + (isLit ? " lit" : " plain");
  });
}

const std::vector<Play> kPlays = {
    {"IsClickedByAReleaseInside",
     kButton,
     {press(100, 279), face(), release(), face()},
     "press+ <1 lit> click+ <0 plain>"},
    {"IsNotClickedByAReleaseOutside",
     kButton,
     {press(100, 279), moveTo(399, 279), face(), moveTo(400, 279), face(), release(), face()},
     "press+ + <1 lit> + <1 plain> + <0 plain>"},
    {"StaysPlainWhenTheFingerComesBack",
     kButton,
     {press(100, 279), moveTo(400, 240), moveTo(100, 200), face(), release()},
     "press+ + + <1 plain> click+"},
    {"IgnoresWhatBeginsOutside",
     kButton,
     {press(99, 240), longPress(), release(), moveTo(100, 279)},
     "- - - -"},
    {"IsClickedByAReleaseWithoutAPress", kButton, {release(100, 279)}, "click+"},
    {"FollowsEveryFingerWhileHeld",
     kButton,
     {finger(2), press(100, 279), face(), finger(0), press(400, 240), face(), finger(5), release(),
      face(), release()},
     "press+ <3 lit> press+ <1 lit> + <0 plain> -"},
    {"IsReleasedByALongPress",
     kButton,
     {press(100, 279), longPress(), lookAtLog(), face(), moveTo(101, 279), lookAtRedraw()},
     "press+ long+ <[BUTTON] long pressed!!> <0 plain> - <still>"},
    {"StaysHeldWithoutALongPressCallback",
     without(&Widget::longPressCallback, kButton),
     {press(100, 279), longPress(400, 240), face(), keyDown(5), release(100, 279)},
     "press+ + <1 lit> - click+"},
    {"CountsClicks",
     kButton,
     {press(100, 279), lookAtLog(), release(), press(), release(), press(), later(499), release()},
     "press+ <[BUTTON] pressed!!> click+ press+ click double+ press+ click+"},
    {"DoesNotCountALateClick",
     kButton,
     {press(100, 279), release(), press(), later(500), release(), lookAtLog()},
     "press+ click+ press+ click+ <[BUTTON] released!!>"},
    {"CountsWhileADoubleClickIsWanted",
     without(&Widget::doubleClickCallback, kButton),
     {press(100, 279), release(), lookAtLog(),
      call([](Widget& button) { button.doubleClickCallback = [](int) { note("double"); }; }),
      press(), release(), press(), release()},
     "press+ click+ <[BUTTON] released!!> press+ click+ press+ click double+"},
    {"IsFreedByHiding",
     kButton,
     {press(100, 279), call(&Widget::hide), face(), moveTo(101, 279), lookAtRedraw()},
     "press+ <0 plain> - <still>"},
    {"AsksForARedrawWhenItsColourComesBack",
     kButton,
     {call(&Widget::restoreColor), lookAtRedraw(), press(100, 279), call(&Widget::restoreColor),
      lookAtRedraw(), face()},
     "<still> press+ <redraw> <1 plain>"},
    {"IsNeitherSeenNorTouchedUntilItsDelayedShow",
     kButton,
     {call(&Widget::onShowTimer, 250), lookAtRedraw(), later(249), timer(), lookAtRedraw(),
      lookAtDrawings(), later(1), press(100, 279), timer(), lookAtRedraw(), lookAtDrawings(),
      press(), timer(), lookAtRedraw()},
     "<redraw> <still> <0> - <redraw> <1> press+ <still>"},
    {"IsMadeActiveByADelayedShow",
     kButton,
     {call(&Widget::setActive, 0), call(&Widget::onShowTimer, 0), look(&Widget::isActive)},
     "<1>"},
};
TEST_P(ButtonPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, ButtonPlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(ButtonTest, ShowsItsLooks) {
  MW::Button button(&kArea, &kCaption);
  EXPECT_EQ(shown(button)[0], (Drawing{Call::ButtonBox, kArea, {}, {"Start", 0xFFFFFFFF, 5, 48}}));
  const SKIA_Rect elsewhere = {1, 2, 3, 4, 0xFF00FF00};
  button.setRect(9, &elsewhere);
  button.setRect(9, nullptr);
  button.setText(std::string(200, 'x').c_str());
  button.setTextColor(1);
  button.setFontSize(20);
  const SKIA_Rect moved = {1, 2, 3, 4, kArea.color};  // the colour is not taken over
  EXPECT_EQ(shown(button)[0],
            (Drawing{Call::ButtonBox, moved, {}, {std::string(127, 'x'), 1, 5, 20}}));
}

}  // namespace
