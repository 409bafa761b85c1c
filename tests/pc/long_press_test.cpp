#include "input/long_press.h"

#include <gtest/gtest.h>

namespace brimol::pc {
namespace {

constexpr ScreenPoint kStart = {500, 500};

class PressedAt : public testing::TestWithParam<uint32_t> {};

TEST_P(PressedAt, BecomesLongOnceAfterHalfASecond) {
  const uint32_t pressed = GetParam();
  LongPress press(1000);
  press.press(kStart, pressed);
  EXPECT_FALSE(press.due(pressed - 1));
  EXPECT_FALSE(press.due(pressed + 499));
  EXPECT_TRUE(press.due(pressed + 500));
  EXPECT_FALSE(press.due(pressed + 501));
}

TEST_P(PressedAt, KnowsTheTimeThatIsLeft) {
  const uint32_t pressed = GetParam();
  LongPress press(1000);
  press.press(kStart, pressed);
  EXPECT_EQ(press.msLeft(pressed), 500u);
  EXPECT_EQ(press.msLeft(pressed + 499), 1u);
  EXPECT_EQ(press.msLeft(pressed + 700), 0u);
  press.due(pressed + 700);
  EXPECT_EQ(press.msLeft(pressed + 700), std::nullopt);
}

INSTANTIATE_TEST_SUITE_P(All, PressedAt, testing::Values(0u, 1000u, 0xFFFFFF00u));

TEST(LongPress, DoesNotComeOnceReleased) {
  LongPress press(1000);
  EXPECT_FALSE(press.due(5000));
  press.press(kStart, 0);
  press.release();
  EXPECT_FALSE(press.due(500));
}

struct SlopCase {
  const char* name;
  int width;
  ScreenPoint by;
  bool stays;
};

class Slop : public testing::TestWithParam<SlopCase> {};

TEST_P(Slop, IsTwoPercentOfTheWidth) {
  LongPress press(GetParam().width);
  press.press(kStart, 0);
  press.move({kStart.x + GetParam().by.x, kStart.y + GetParam().by.y});
  press.move(kStart);  // coming back does not help
  EXPECT_EQ(press.due(500), GetParam().stays);
}

INSTANTIATE_TEST_SUITE_P(All, Slop,
                         testing::Values(SlopCase{"Exactly", 1000, {20, 0}, true},
                                         SlopCase{"JustAbove", 1000, {-21, 0}, false},
                                         SlopCase{"Down", 1000, {0, 21}, false},
                                         SlopCase{"SlantingWithin", 1000, {12, -16}, true},
                                         SlopCase{"SlantingAbove", 1000, {13, 16}, false},
                                         SlopCase{"FractionBelow", 1440, {28, 0}, true},
                                         SlopCase{"FractionAbove", 1440, {29, 0}, false},
                                         SlopCase{"TinyScreen", 10, {1, 0}, false},
                                         SlopCase{"WidestScreen", 16384, {16383, 0}, false}),
                         [](const auto& row) { return row.param.name; });

}  // namespace
}  // namespace brimol::pc
