#include "display/window_fit.h"

#include <gtest/gtest.h>

#include <array>

#include "pc/support/painting.h"

namespace brimol::pc {
namespace {

constexpr Size kScreen = {200, 300};

struct FitCase {
  const char* name;
  Size screen, area, fitted;
};

constexpr auto kFitCases = std::to_array<FitCase>({
    {"larger than the screen", {100, 200}, {300, 300}, {150, 300}},
    {"a low desktop", {1440, 2560}, {1920, 1040}, {585, 1040}},
    {"a narrow desktop", {1440, 2560}, {360, 2000}, {360, 640}},
    {"at least a pixel high", {16384, 1}, {10, 10}, {10, 1}},
    {"a pixel less", {16384, 16384}, {16383, 16383}, {16383, 16383}},
});

TEST(WindowFit, KeepsTheProportionsAndFillsAWindowOfThatSize) {
  for (const auto& [name, screen, area, fitted] : kFitCases) {
    SCOPED_TRACE(name);
    EXPECT_EQ(fittedSize(screen, area), fitted);
    const WindowFit fit = WindowFit::of(screen, fitted);
    EXPECT_EQ(fit.shown, (Area{0, 0, fitted.w, fitted.h}));
    EXPECT_EQ(fit.toScreen({0, 0}), (ScreenPoint{0, 0}));
    EXPECT_EQ(fit.toScreen({fitted.w - 1, 0}).x, screen.w - 1);
  }
}

TEST(WindowFit, MeansThePicturesEdgeBesideIt) {
  const WindowFit centred = WindowFit::of({100, 100}, {400, 300});
  EXPECT_EQ(centred.toScreen({50 + 3, 299}), (ScreenPoint{1, 99}));
  EXPECT_EQ(centred.toScreen({-5, 500}), (ScreenPoint{0, 99}));
  EXPECT_EQ(WindowFit::of(kScreen, {0, -3}).toScreen({0, 0}), (ScreenPoint{0, 0}));
}

}  // namespace
}  // namespace brimol::pc
