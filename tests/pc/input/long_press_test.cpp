#include "input/long_press.h"

#include <gtest/gtest.h>

#include <array>

namespace brimol::pc {
namespace {

struct SlopCase {
  const char* name;
  int width;       // of the screen, in pixels
  ScreenPoint by;  // how far the finger moves, before it comes back
  bool isLongPress;
};

constexpr auto kSlopCases = std::to_array<SlopCase>({
    {"two per cent, slanting", 1000, {12, -16}, true},
    {"a pixel more", 1000, {-13, 16}, false},
    {"less than 29 pixels of 1440", 1440, {0, 28}, true},
    {"29 pixels of 1440", 1440, {0, 29}, false},
    {"all of the largest screen", 16384, {16383, 0}, false},
});

TEST(LongPress, AllowsMotionOfTwoPercentOfTheWidth) {
  for (const auto& [name, width, by, isLongPress] : kSlopCases) {
    LongPress finger(width);
    finger.press({500, 500}, 0);
    finger.move({500 + by.x, 500 + by.y});
    finger.move({500, 500});
    EXPECT_EQ(finger.due(500), isLongPress) << name;
    EXPECT_FALSE(finger.due(501)) << name << ", a second time";
  }
}

}  // namespace
}  // namespace brimol::pc
