#include <MW/button8.h>

#include <climits>

#include "support/drawings.h"
#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using Button8Test = WidgetTest;
using Button8Plays = PlayTest;
using MW::Button8;

constexpr SKIA_Rect kArea = {0, 0, 400, 800, 5};

// A pad that tells which cells are held.
Maker pad(int layout) {
  return [layout] {
    auto made = std::make_unique<Button8>(layout, &kArea, nullptr);
    made->setActive(1);
    made->pressCallback = [](MW::mouse_event* mouse) {
      noteTouch("held" + std::to_string(mouse->state), mouse);
    };
    made->clickCallback = [](MW::mouse_event* mouse) {
      noteTouch("free" + std::to_string(mouse->state), mouse);
    };
    return made;
  };
}

// The numbers of the cells that are drawn as held.
Step redCells() {
  return look([](MW::Widget& widget) {
    const std::vector<Drawing> drawn = shown(widget);
    std::string red = "red";
    for (std::size_t i = 0; i < drawn.size(); i += 2) {
      if (drawn.at(i).rect.color == MW::kColorRed) red += ' ' + std::to_string(i / 2);
    }
    return red;
  });
}

const std::vector<Play> kPlays = {
    {"EachCellHasItsOwnFinger",
     pad(Button8::kFourByTwo),
     {press(21, 25), finger(4), press(379, 387), redCells(), finger(0), release(21, 25),
      redCells()},
     "held1+ held9+ <red 0 3> free8+ <red 3>"},
    {"AnEdgeBelongsToNoCell", pad(Button8::kFourByTwo), {press(20, 25), press(21, 24)}, "+ +"},
    {"AFingerThatSlidesAwayLeavesItsCellHeld",
     pad(Button8::kFourByTwo),
     {press(21, 25), moveTo(30, 300), longPress(), release(), release(5, 5), redCells()},
     "held1+ - - free1+ + <red 0>"},
    {"AnyFingerFreesACell",
     pad(Button8::kFourByTwo),
     {press(21, 25), finger(6), release(30, 30), lookAtLog()},
     "held1+ free0+ <[BUTTON8] released (0) - state = 0 !!>"},
    {"TakesNothingOutside",
     pad(Button8::kOneCell),
     {press(400, 5), finger(2), press(30, 300), lookAtLog()},
     "- held1+ <[BUTTON8] pressed (0) - state = 1  3,0,0,0,0,0,0,0!!>"},
    {"HidingFreesAllCells",
     pad(Button8::kTwoByTwo),
     {press(100, 300), call(&MW::Widget::hide), redCells(), look(&MW::Widget::isActive)},
     "held1+ <red> <0>"},
};
TEST_P(Button8Plays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, Button8Plays, testing::ValuesIn(kPlays), kRowName);

TEST_F(Button8Test, LaysOutItsCellsInAnyRectangle) {
  Button8 pad(6, &kArea, nullptr);
  EXPECT_TRUE(shown(pad).empty()) << "no layout";
  for (const int size : {0, 1, -7, INT_MIN, INT_MAX}) {
    const SKIA_Rect area = {size, -(size / 2), size, -(size / 2), 0};
    pad.setRect(Button8::kTwoByFour, &area);
    EXPECT_EQ(shown(pad).size(), 16U);
  }
  pad.setRect(-1, &kArea);  // no layout: the shape stays
  EXPECT_EQ(places({shown(pad).at(2), shown(pad).at(15)}), "109,210 85x85|303,505 85x85|");
}

}  // namespace
