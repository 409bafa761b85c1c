#include <MW/button8.h>
#include <MW/button_new.h>
#include <MW/button_s.h>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ButtonVariantsTest = WidgetTest;

constexpr SKIA_Rect kArea = {10, 20, 100, 50, 5};
constexpr SKIA_Rect kPadArea = {0, 0, 400, 800, 5};
std::unique_ptr<MW::Widget> button;
std::string told;
int callsLeft;  // before the one that deletes the button

void note(const std::string& what) {
  told += what;
  if (--callsLeft == 0) button.reset();
}
void noteMask(MW::mouse_event* mouse) {
  note(std::to_string(mouse->finger) + '=' + std::to_string(mouse->state));
}

struct Gesture {
  char which;  // s ButtonS, n ButtonNew, 8 Button8 of kPadArea
  int style;
  const char* steps;   // M, P, R or L for the events, with a finger and its place
  const char* told;    // callbacks, and whether the event was taken
  const char* logged;  // last
};
constexpr auto kGestures = std::to_array<Gesture>({
    {'s', 4, "P2 10 20 M2 112 20 R2 112 20", "p+++", "S] released!!"},
    {'s', 2, "P0 50 40 M0 60 40 R0 60 40", "p--c-", "S] onTouchClickCount!! 1"},
    {'s', 7, "P0 50 40 M0 130 40 M0 129 69 M0 120 40 R0 120 40", "p--c---", "S] out of area!!"},
    {'n', 0, "P1 109 69 M1 9 9 L1 9 9 R1 9 9 R1 50 40", "p+-l+-c+", "NEW] released!!"},
    {'n', 0, "P0 50 40 R0 50 40 P0 50 40 R0 50 40", "p+c+p+cd+", "NEW] released!!"},
    // On an edge, in two cells, away from one, another finger's release in it, in none.
    {'8', 3, "P0 20 25 P0 21 25 P4 379 387 M0 30 300 R0 30 300 R6 30 30 R4 5 5",
     "+0=1+4=9+-0=9+6=8++", "8] released (0) - state = 8 !!"},
    {'8', 0, "P0 400 5 P2 30 300", "-2=1+", "8] pressed (0) - state = 1  3,0,0,0,0,0,0,0!!"},
});

void play(const Gesture& row, int deletingCall) {
  if (row.which == 's') button = std::make_unique<MW::ButtonS>(row.style, &kArea, nullptr);
  if (row.which == 'n') button = std::make_unique<MW::ButtonNew>(row.style, &kArea, nullptr);
  if (row.which == '8') button = std::make_unique<MW::Button8>(row.style, &kPadArea, nullptr);
  button->pressCallback = [](int) { note("p"); };
  button->clickCallback = [](int) { note("c"); };
  button->longPressCallback = [](int) { note("l"); };
  button->doubleClickCallback = [](int) { note("d"); };
  if (row.which == '8') button->pressCallback = button->clickCallback = noteMask;
  told.clear();
  callsLeft = deletingCall;
  std::istringstream in(row.steps);
  MW::mouse_event at = {};
  for (char code = 0; button != nullptr && in >> code >> at.finger >> at.x >> at.y;) {
    const auto type = static_cast<int>(std::string("MPRL").find(code));
    told += offer(*button, {.type = type, .mouse = at}) ? '+' : '-';
  }
}

TEST_F(ButtonVariantsTest, GoByTheStepsOfAGestureAndMayBeDeleted) {
  platform().ticks = 1000;
  for (const Gesture& row : kGestures) {
    play(row, 0);
    EXPECT_EQ(told, row.told);
    EXPECT_EQ(platform().takeLog().back().message, "[BUTTON" + std::string(row.logged));
    EXPECT_EQ(button->getBgColor(), 5U) << "it does not light up";
    for (int call = -callsLeft; call > 0; --call) {
      play(row, call);
      EXPECT_EQ(button, nullptr);
    }
  }
}

TEST_F(ButtonVariantsTest, FramesEndBelowAndRightOfTheFace) {
  MW::ButtonNew framed(2, &kArea, nullptr);
  EXPECT_EQ(shown(framed).at(4).line, (SKIA_Point{110, 20, 110, 70, 0, 1}));
  EXPECT_EQ(shown(*std::make_unique<MW::ButtonNew>(3, &kArea, nullptr)).size(), 1U);
}

TEST_F(ButtonVariantsTest, PadsLayOutTheirCellsInAnyRectangle) {
  MW::Button8 pad(6, &kPadArea, nullptr);
  EXPECT_TRUE(shown(pad).empty());
  for (const int size : {0, 1, -7, INT_MIN, INT_MAX}) {
    const SKIA_Rect area = {size, -(size / 2), size, -(size / 2), 0};
    pad.setRect(5, &area);
    EXPECT_EQ(shown(pad).size(), 16U);
  }
  pad.setRect(-1, &kPadArea);  // no layout: the shape stays
  EXPECT_EQ(places({shown(pad).at(2), shown(pad).at(15)}), "109,210 85x85|303,505 85x85|");
}

}  // namespace
