#include <MW/button8.h>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using Button8Test = WidgetTest;
using MW::Button8;

constexpr SKIA_Rect kArea = {0, 0, 400, 800, 5};

// A pad that tells which cells are held.
PlaysOn pad(int layout) {
  return {[layout] {
    auto made = std::make_unique<Button8>(layout, &kArea, nullptr);
    made->setActive(1);
    made->pressCallback = made->clickCallback = [](MW::mouse_event* mouse) {
      noteTouch("held" + std::to_string(mouse->state), mouse);
    };
    return made;
  }};
}
const PlaysOn kPad = pad(Button8::kFourByTwo);

const PlayTests kPlays = {
    kPad("EachCellHasItsOwnFinger",
         {press(21, 25), finger(4), press(379, 387), lookAtLog(), finger(0), release(21, 25)},
         "held1+ held9+ <[BUTTON8] pressed (3) - state = 9  1,0,0,5,0,0,0,0!!> held8+"),
    kPad("AnEdgeBelongsToNoCell", {press(20, 25), press(21, 24)}, "+ +"),
    kPad("AFingerThatSlidesAwayLeavesItsCellHeld",
         {press(21, 25), moveTo(30, 300), longPress(), release(), release(5, 5)},
         "held1+ - - held1+ +"),
    kPad("AnyFingerFreesACell", {press(21, 25), finger(6), release(30, 30), lookAtLog()},
         "held1+ held0+ <[BUTTON8] released (0) - state = 0 !!>"),
    pad(Button8::kOneCell)("TakesNothingOutside", {press(400, 5), press(399, 5)}, "- +"),
    kPad("HidingFreesAllCells",
         {press(100, 300), call(&MW::Widget::hide), look(&MW::Widget::isActive), press(300, 300)},
         "held4+ <0> held8+"),
};

struct Open : Button8 {
  using Button8::Button8;
  using Button8::point;
};

TEST_F(Button8Test, KeepsTheBorderThatItIsGiven) {
  Open pad(Button8::kOneCell, &kArea, nullptr);
  EXPECT_EQ(pad.point.width, 1);
  pad.setBdWidth(7);
  pad.setBdColor(9);
  EXPECT_EQ(std::pair(pad.point.width, pad.point.color), std::pair(7, 9U));
}

TEST_F(Button8Test, AnUnknownLayoutKeepsTheShape) {
  Button8 pad(6, &kArea, nullptr);
  EXPECT_TRUE(shown(pad).empty()) << "no cells at first";
  pad.setRect(Button8::kTwoByFour, &kArea);
  pad.setRect(-1, &kArea);
  EXPECT_EQ(places({shown(pad).at(2), shown(pad).at(15)}), "109,210 85x85|303,505 85x85|");
}

}  // namespace
