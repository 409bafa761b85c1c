#include "window_canvas.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <string>

#include "painting.h"

namespace brimol::pc {
namespace {

constexpr Size kScreen = {200, 300};
constexpr cairo_rectangle_int_t kAll = {0, 0, kScreen.w, kScreen.h};
constexpr int kMostColour = 0xFFFFFF;

/// A picture of noise, of which rectangles are replaced by other noise.
class Noise {
 public:
  Noise() { refill(kAll); }
  cairo_surface_t* picture() const { return surface.get(); }
  int upTo(int most) { return std::uniform_int_distribution<int>(0, most)(numbers); }

  cairo_rectangle_int_t refillSome() {
    const int x = upTo(kScreen.w - 1);
    const int y = upTo(kScreen.h - 1);
    const cairo_rectangle_int_t part = {x, y, 1 + upTo(kScreen.w - 1 - x) / 4,
                                        1 + upTo(kScreen.h - 1 - y) / 4};
    refill(part);
    return part;
  }

 private:
  void refill(const cairo_rectangle_int_t& part) {
    const CairoContext context(cairo_create(surface.get()));
    for (int y = part.y; y < part.y + part.height; ++y) {
      for (int x = part.x; x < part.x + part.width; ++x) {
        const double grey = upTo(kMostColour) / double{kMostColour};
        cairo_set_source_rgb(context.get(), grey, 1 - grey, upTo(1));
        cairo_rectangle(context.get(), x, y, 1, 1);
        cairo_fill(context.get());
      }
    }
  }

  CairoSurface surface{cairo_image_surface_create(CAIRO_FORMAT_RGB24, kScreen.w, kScreen.h)};
  std::mt19937 numbers{20};
};

bool isIn(const Region& region, int x, int y) {
  return std::ranges::any_of(region, [x, y](const cairo_rectangle_int_t& part) {
    return part.x <= x && x < part.x + part.width && part.y <= y && y < part.y + part.height;
  });
}

/// Pixels that differ, though they are not in the region.
int countUntold(const Picture& before, const Picture& after, const Region& told) {
  int count = 0;
  for (int y = 0; y < after.size.h; ++y) {
    for (int x = 0; x < after.size.w; ++x) {
      if (before.at(x, y) != after.at(x, y) && !isIn(told, x, y)) ++count;
    }
  }
  return count;
}

class WindowCanvasTest : public testing::TestWithParam<Size> {};

TEST_P(WindowCanvasTest, IsTheSameByPartsAndAtOnce) {
  Noise noise;
  WindowCanvas byParts(kScreen, GetParam());
  byParts.update(noise.picture(), {kAll});
  for (int round = 0; round < 40; ++round) {
    const Picture before = pictureOf(byParts.pixels());
    const Region changed = {noise.refillSome(), noise.refillSome()};
    const Region told = byParts.update(noise.picture(), changed);
    WindowCanvas atOnce(kScreen, GetParam());
    atOnce.update(noise.picture(), {kAll});
    const Picture after = pictureOf(byParts.pixels());
    ASSERT_TRUE(after == pictureOf(atOnce.pixels())) << "round " << round;
    ASSERT_EQ(countUntold(before, after, told), 0) << "round " << round;
  }
}

INSTANTIATE_TEST_SUITE_P(Sizes, WindowCanvasTest,
                         testing::Values(Size{200, 300}, Size{199, 299}, Size{150, 220},
                                         Size{100, 150}, Size{77, 111}, Size{20, 30}, Size{90, 40},
                                         Size{260, 310}),
                         [](const auto& row) {
                           return std::to_string(row.param.w) + "x" + std::to_string(row.param.h);
                         });

TEST(WindowCanvas, CopiesAtFullSize) {
  const Noise noise;
  WindowCanvas canvas(kScreen, kScreen);
  canvas.update(noise.picture(), {kAll});
  EXPECT_TRUE(pictureOf(canvas.pixels()) == pictureOf(noise.picture()));
}

TEST(WindowCanvas, AveragesWhatIsScaledAndLeavesTheRestBlack) {
  const CairoSurface halves(cairo_image_surface_create(CAIRO_FORMAT_RGB24, kScreen.w, kScreen.h));
  const CairoContext context(cairo_create(halves.get()));
  for (int x = 0; x < kScreen.w; x += 2) cairo_rectangle(context.get(), x, 0, 1, kScreen.h);
  cairo_set_source_rgb(context.get(), 1, 1, 1);
  cairo_fill(context.get());
  WindowCanvas canvas(kScreen, {120, 150});
  canvas.update(halves.get(), {kAll});
  const Picture shown = pictureOf(canvas.pixels());
  EXPECT_EQ(shown.at(60, 75), 0x808080U) << "every second column is white";
  EXPECT_EQ(shown.at(9, 75), 0U);
  EXPECT_NE(shown.at(10, 75), 0U);
}

}  // namespace
}  // namespace brimol::pc
