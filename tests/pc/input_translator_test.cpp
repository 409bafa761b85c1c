#include "input/input_translator.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "record_text.h"

namespace brimol::pc {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr PointerId kThumb = {1, 40};
constexpr PointerId kIndex = {1, 41};
constexpr PointerId kOtherDevice = {2, 40};

class TranslatorTest : public testing::Test {
 protected:
  TranslatorTest() { service.open(); }
  std::vector<std::string> taken() { return takeTexts(service); }

  InputService service;
  InputTranslator input{{1000, 2000}, service};
};

TEST_F(TranslatorTest, TellsPressMotionAndReleaseOfTheMouse) {
  input.pointerMove(kMouse, {1, 1}, 0);
  input.pointerDown(kMouse, {10, 20}, 0);
  input.pointerMove(kMouse, {15, 18}, 1);
  input.pointerMove(kMouse, {15, 18}, 2);
  input.pointerUp(kMouse, {16, 18}, 3);
  input.pointerUp(kMouse, {16, 18}, 4);
  EXPECT_THAT(taken(),
              ElementsAre("down 0 at 10,20", "motion 0 at 15,18 by 5,-2", "up 0 at 16,18"));
}

TEST_F(TranslatorTest, GivesEveryPointerTheLowestFreeFinger) {
  input.pointerDown(kThumb, {1, 1}, 0);
  input.pointerDown(kMouse, {2, 2}, 0);
  input.pointerDown(kOtherDevice, {3, 3}, 0);
  input.pointerUp(kThumb, {1, 1}, 1);
  input.pointerMove(kOtherDevice, {4, 3}, 1);
  input.pointerDown(kIndex, {5, 5}, 1);
  input.pointerUp(kOtherDevice, {4, 3}, 2);
  input.pointerUp(kMouse, {2, 2}, 2);
  EXPECT_THAT(taken(),
              ElementsAre("down 0 at 1,1", "down 1 at 2,2", "down 2 at 3,3", "up 0 at 1,1",
                          "motion 2 at 4,3 by 1,0", "down 0 at 5,5", "up 2 at 4,3", "up 1 at 2,2"));
}

TEST_F(TranslatorTest, IgnoresPointersBeyondTheFingers) {
  for (int i = 0; i <= Pointers::kFingers; ++i) input.pointerDown({1, i}, {i, 0}, 0);
  EXPECT_EQ(taken().size(), static_cast<std::size_t>(Pointers::kFingers));
  input.pointerMove({1, Pointers::kFingers}, {50, 50}, 1);
  input.pointerUp({1, Pointers::kFingers}, {50, 50}, 1);
  EXPECT_THAT(taken(), IsEmpty());
}

TEST_F(TranslatorTest, KeepsPositionsOnTheScreen) {
  input.pointerDown(kMouse, {-5, 2000}, 0);
  input.pointerMove(kMouse, {5000, -1}, 1);
  input.pointerMove(kMouse, {6000, -9}, 1);
  input.pointerUp(kMouse, {1000, 3}, 2);
  EXPECT_THAT(taken(),
              ElementsAre("down 0 at 0,1999", "motion 0 at 999,0 by 999,-1999", "up 0 at 999,3"));
}

TEST_F(TranslatorTest, PinsFingersOfTheMouseWhileShiftIsDown) {
  input.keyDown(SDLK_LSHIFT);
  input.pointerDown(kMouse, {1, 1}, 0);
  input.pointerUp(kMouse, {2, 1}, 1);
  input.pointerDown(kMouse, {5, 5}, 2);
  input.pointerMove(kMouse, {6, 5}, 3);
  input.pointerDown(kThumb, {9, 9}, 3);
  input.pointerUp(kThumb, {9, 9}, 3);
  EXPECT_THAT(taken(), ElementsAre("down 0 at 1,1", "motion 0 at 2,1 by 1,0", "down 1 at 5,5",
                                   "motion 1 at 6,5 by 1,0", "down 2 at 9,9", "up 2 at 9,9"));
  input.keyDown(SDLK_RSHIFT);
  input.keyUp(SDLK_LSHIFT);
  EXPECT_THAT(taken(), IsEmpty());
  input.keyUp(SDLK_RSHIFT);
  input.pointerUp(kMouse, {6, 5}, 4);
  EXPECT_THAT(taken(), ElementsAre("up 0 at 2,1", "up 1 at 6,5"));
}

TEST_F(TranslatorTest, ReportsLongPressesInTheOrderOfTime) {
  input.pointerDown(kMouse, {1, 1}, 1000);
  input.pointerDown(kThumb, {2, 2}, 1200);
  EXPECT_EQ(input.msToLongPress(1300), 200u);
  input.tick(1499);
  input.pointerMove(kMouse, {2, 1}, 1499);
  input.pointerUp(kMouse, {2, 1}, 1600);
  EXPECT_EQ(input.msToLongPress(1600), 100u);
  input.pointerUp(kThumb, {2, 2}, 1699);
  input.tick(5000);
  EXPECT_EQ(input.msToLongPress(5000), std::nullopt);
  EXPECT_THAT(taken(), ElementsAre("down 0 at 1,1", "down 1 at 2,2", "motion 0 at 2,1 by 1,0",
                                   "long 0 at 2,1", "up 0 at 2,1", "up 1 at 2,2"));
}

TEST_F(TranslatorTest, TellsEveryKeyOnceHoweverItRepeats) {
  input.keyUp(SDLK_UP);
  input.keyDown(SDLK_UP);
  input.keyDown(SDLK_UP);
  input.keyDown(SDLK_q);
  input.keyDown(SDLK_RETURN);
  input.keyDown(SDLK_KP_ENTER);
  input.keyUp(SDLK_RETURN);
  EXPECT_THAT(taken(), ElementsAre("key down 273", "key down 327"));
  input.keyUp(SDLK_KP_ENTER);
  input.keyUp(SDLK_q);
  input.keyUp(SDLK_UP);
  EXPECT_THAT(taken(), ElementsAre("key up 327", "key up 273"));
}

TEST_F(TranslatorTest, LiftsEverythingWhenTheFocusIsLost) {
  input.keyDown(SDLK_LSHIFT);
  input.keyDown(SDLK_h);
  input.pointerDown(kMouse, {1, 1}, 0);
  input.pointerUp(kMouse, {1, 1}, 0);
  input.pointerDown(kMouse, {7, 7}, 0);
  taken();
  input.releaseAll();
  EXPECT_THAT(taken(), ElementsAre("key up 323", "up 0 at 1,1", "up 1 at 7,7"));
  input.keyUp(SDLK_h);
  input.pointerUp(kMouse, {7, 7}, 1);
  input.tick(1000);
  input.pointerDown(kMouse, {8, 8}, 1000);
  input.pointerUp(kMouse, {8, 8}, 1001);
  EXPECT_THAT(taken(), ElementsAre("down 0 at 8,8", "up 0 at 8,8"));
}

}  // namespace
}  // namespace brimol::pc
