#include "window_canvas.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <random>

namespace brimol::pc {
namespace {

constexpr Size kScreen = {200, 300};
constexpr cairo_rectangle_int_t kAll = {0, 0, kScreen.w, kScreen.h};
constexpr std::uint32_t kColourBits = 0xFFFFFF;  // the fourth byte of a pixel means nothing

/// Pixels by position, so that pictures compare as values.
std::vector<std::uint32_t> pixelsOf(cairo_surface_t* surface) {
  const int width = cairo_image_surface_get_width(surface);
  const int height = cairo_image_surface_get_height(surface);
  std::vector<std::uint32_t> pixels(static_cast<std::size_t>(width * height));
  for (int y = 0; y < height; ++y) {
    std::memcpy(&pixels[static_cast<std::size_t>(y * width)],
                cairo_image_surface_get_data(surface) + y * cairo_image_surface_get_stride(surface),
                static_cast<std::size_t>(width) * sizeof(std::uint32_t));
  }
  for (std::uint32_t& pixel : pixels) pixel &= kColourBits;
  return pixels;
}

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
    for (int y = part.y; y < part.y + part.height; ++y) {
      unsigned char* const row = cairo_image_surface_get_data(surface.get()) +
                                 y * cairo_image_surface_get_stride(surface.get());
      for (int x = part.x; x < part.x + part.width; ++x) {
        const auto colour = static_cast<std::uint32_t>(upTo(kColourBits));
        std::memcpy(row + x * 4, &colour, sizeof colour);
      }
    }
    cairo_surface_mark_dirty(surface.get());
  }

  CairoSurface surface{cairo_image_surface_create(CAIRO_FORMAT_RGB24, kScreen.w, kScreen.h)};
  std::mt19937 numbers{20};
};

class WindowCanvasTest : public testing::TestWithParam<Size> {};

TEST_P(WindowCanvasTest, IsTheSameByPartsAndAtOnce) {
  Noise noise;
  WindowCanvas byParts(kScreen, GetParam());
  byParts.update(noise.picture(), {kAll});
  for (int round = 0; round < 40; ++round) {
    const std::vector<std::uint32_t> before = pixelsOf(byParts.pixels());
    const Region changed = {noise.refillSome(), noise.refillSome()};
    const Region told = byParts.update(noise.picture(), changed);
    WindowCanvas atOnce(kScreen, GetParam());
    atOnce.update(noise.picture(), {kAll});
    const std::vector<std::uint32_t> after = pixelsOf(byParts.pixels());
    ASSERT_EQ(after, pixelsOf(atOnce.pixels())) << "round " << round;
    for (std::size_t i = 0; i < after.size(); ++i) {
      if (before[i] == after[i]) continue;
      const int x = static_cast<int>(i) % GetParam().w;
      const int y = static_cast<int>(i) / GetParam().w;
      ASSERT_TRUE(std::ranges::any_of(told,
                                      [&](const cairo_rectangle_int_t& part) {
                                        return part.x <= x && x < part.x + part.width &&
                                               part.y <= y && y < part.y + part.height;
                                      }))
          << x << ',' << y << " changed untold";
    }
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
  EXPECT_EQ(pixelsOf(canvas.pixels()), pixelsOf(noise.picture()));
}

TEST(WindowCanvas, AveragesWhatIsScaledAndLeavesTheRestBlack) {
  const CairoSurface halves(cairo_image_surface_create(CAIRO_FORMAT_RGB24, kScreen.w, kScreen.h));
  const CairoContext context(cairo_create(halves.get()));
  for (int x = 0; x < kScreen.w; x += 2) cairo_rectangle(context.get(), x, 0, 1, kScreen.h);
  cairo_set_source_rgb(context.get(), 1, 1, 1);
  cairo_fill(context.get());
  WindowCanvas canvas(kScreen, {120, 150});
  canvas.update(halves.get(), {kAll});
  const std::vector<std::uint32_t> pixels = pixelsOf(canvas.pixels());
  const std::size_t middle = 75 * 120 + 60;
  EXPECT_EQ(pixels[middle], 0x808080U) << "every second column is white";
  EXPECT_EQ(pixels[75 * 120 + 9], 0U);
  EXPECT_NE(pixels[75 * 120 + 10], 0U);
}

}  // namespace
}  // namespace brimol::pc
