#include "window_fit.h"

#include <gtest/gtest.h>

namespace brimol::pc {
namespace {

struct FitCase {
  const char* name;
  Size screen, area, fitted;
};
class FittedSize : public testing::TestWithParam<FitCase> {};

TEST_P(FittedSize, KeepsTheProportions) {
  EXPECT_EQ(fittedSize(GetParam().screen, GetParam().area), GetParam().fitted);
}

INSTANTIATE_TEST_SUITE_P(
    All, FittedSize,
    testing::Values(FitCase{"Larger", {100, 200}, {300, 300}, {100, 200}},
                    FitCase{"Same", {100, 200}, {100, 200}, {100, 200}},
                    FitCase{"HeightDecides", {1440, 2560}, {1920, 1040}, {585, 1040}},
                    FitCase{"WidthDecides", {1440, 2560}, {360, 2000}, {360, 640}},
                    FitCase{"NeverEmpty", {16384, 1}, {10, 10}, {10, 1}},
                    FitCase{"NoOverflow", {16384, 16384}, {16383, 16383}, {16383, 16383}}),
    [](const auto& row) { return row.param.name; });

TEST(WindowFit, FillsAWindowOfAFittedSize) {
  for (const Size screen : {Size{1440, 2560}, Size{2560, 1440}, Size{16384, 3}, Size{7, 5}}) {
    for (int side = 1; side < 2000; ++side) {
      const Size window = fittedSize(screen, {side, side});
      const cairo_rectangle_int_t shown = WindowFit::of(screen, window).shown;
      ASSERT_EQ((Size{shown.width, shown.height}), window) << side;
    }
  }
}

// Every window pixel in turn means a screen pixel no further left, from the first to the last.
TEST(WindowFit, ReachesTheWholeScreen) {
  for (const int window : {2, 3, 500, 999, 1000}) {
    const WindowFit fit = WindowFit::of({1000, 1000}, {window, window});
    int last = fit.toScreen({0, 0}).x;
    EXPECT_EQ(last, 0);
    for (int x = 0; x < window; ++x) {
      const int now = fit.toScreen({x, 0}).x;
      EXPECT_LE(last, now);
      last = now;
    }
    EXPECT_EQ(fit.toScreen({window - 1, window - 1}), (ScreenPoint{999, 999})) << window;
  }
}

TEST(WindowFit, MeansThePixelItselfAtFullSize) {
  const WindowFit fit = WindowFit::of({300, 400}, {300, 400});
  for (int x = 0; x < 300; ++x) EXPECT_EQ(fit.toScreen({x, x}), (ScreenPoint{x, x}));
}

TEST(WindowFit, CentresInALargerWindow) {
  const WindowFit fit = WindowFit::of({100, 100}, {200, 120});
  EXPECT_EQ(fit.toScreen({50, 10}), (ScreenPoint{0, 0}));
  EXPECT_EQ(fit.toScreen({149, 109}), (ScreenPoint{99, 99}));
  EXPECT_EQ(fit.toScreen({-5, 500}), (ScreenPoint{0, 99})) << "beside the picture: its edge";
}

TEST(WindowFit, TakesAWindowOfOnePixel) {
  const WindowFit fit = WindowFit::of({1440, 2560}, {0, -3});
  EXPECT_EQ(fit.window, (Size{1, 1}));
  EXPECT_EQ(fit.toScreen({0, 0}), (ScreenPoint{0, 0}));
}

}  // namespace
}  // namespace brimol::pc
