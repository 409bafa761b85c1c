#include <MW/detail/finger_hold.h>
#include <gtest/gtest.h>

namespace {

constexpr MW::mouse_event touchOf(uint32_t finger) {
  return {.state = 0, .finger = finger, .x = 0, .y = 0, .xrel = 0, .yrel = 0};
}

TEST(FingerHoldTest, BelongsToTheFingerThatPressed) {
  std::atomic<int> selection = 0;
  MW::FingerHold hold(selection);
  EXPECT_FALSE(hold.isHeld());
  EXPECT_FALSE(hold.isOwner(touchOf(0)) || hold.isOthers(touchOf(0))) << "nobody's";
  hold.press(touchOf(0));
  EXPECT_TRUE(hold.isOwner(touchOf(0)) && hold.isOthers(touchOf(1)));
  EXPECT_FALSE(hold.isOwner(touchOf(1)) || hold.isOthers(touchOf(0)));
  EXPECT_EQ(selection, 1) << "the window's routing reads it";
  hold.press(touchOf(4));
  EXPECT_TRUE(hold.isOwner(touchOf(4)) && hold.isOthers(touchOf(0)));
  hold.letGo();
  EXPECT_FALSE(hold.isHeld() || hold.isOthers(touchOf(0)));
}

}  // namespace
