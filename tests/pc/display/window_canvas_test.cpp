#include "display/window_canvas.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <random>

#include "pc/support/painting.h"

namespace brimol::pc {
namespace {

constexpr Size kScreen = {200, 300};
constexpr Area kAll = {0, 0, kScreen.w, kScreen.h};

/// Other pixels in that part.
void addNoise(cairo_surface_t* picture, const Area& part, std::mt19937& random) {
  unsigned char* const data = cairo_image_surface_get_data(picture);
  for (int i = 0; i < part.width * part.height * 4; ++i) {
    const int y = part.y + i / 4 / part.width;
    data[(y * kScreen.w + part.x) * 4 + i % (part.width * 4)] = static_cast<uint8_t>(random());
  }
}

void copyPart(const Picture& from, const Area& part, Picture& to) {
  for (int y = part.y; y < part.y + part.height; ++y) {
    const auto start = y * from.size.w + part.x;
    std::copy_n(from.pixels.begin() + start, part.width, to.pixels.begin() + start);
  }
}

TEST(WindowCanvas, IsTheSameByPartsAndAtOnce) {
  std::mt19937 random(20);
  const auto upTo = [&](int most) { return std::uniform_int_distribution(0, most)(random); };
  const CairoSurface noise(cairo_image_surface_create(CAIRO_FORMAT_RGB24, kScreen.w, kScreen.h));
  addNoise(noise.get(), kAll, random);
  for (const Size window : std::to_array<Size>(
           {{200, 300}, {199, 299}, {150, 220}, {100, 150}, {77, 111}, {90, 40}, {260, 310}})) {
    WindowCanvas byParts(kScreen, window);
    byParts.update(noise.get(), {kAll});
    Picture presented = pictureOf(byParts.pixels());
    for (int round = 0; round < 40; ++round) {
      const Region changed = {{upTo(190), upTo(290), 1 + upTo(9), 1 + upTo(9)},
                              {upTo(150), 7, 50, 3}};
      for (const Area& part : changed) addNoise(noise.get(), part, random);
      const Region told = byParts.update(noise.get(), changed);
      const Picture shown = pictureOf(byParts.pixels());
      for (const Area& part : told) copyPart(shown, part, presented);
      WindowCanvas atOnce(kScreen, window);
      atOnce.update(noise.get(), {kAll});
      ASSERT_TRUE(presented == pictureOf(atOnce.pixels())) << window.w << ", round " << round;
    }
  }
}

TEST(WindowCanvas, AveragesWhatIsScaledAndLeavesTheRestBlack) {
  Painter painter(kScreen);
  Frame columns;
  for (int x = 0; x < kScreen.w; x += 2) columns.push_back(boxItem({x, 0, 1, kScreen.h, kWhite}));
  painter.paint(columns);
  WindowCanvas whole(kScreen, kScreen);
  whole.update(painter.picture(), {kAll});
  EXPECT_EQ(pictureOf(whole.pixels()), pictureOf(painter.picture()));
  WindowCanvas half(kScreen, {120, 150});
  half.update(painter.picture(), {kAll});
  const Picture shown = pictureOf(half.pixels());
  EXPECT_EQ(shown.inkIn({10, 0, 100, 150}, 0x808080), 0) << "every second column is white";
  EXPECT_EQ(shown.inked(), (Area{10, 0, 100, 150}));
  painter.paint({boxItem({0, 0, kScreen.w, kScreen.h, kWhite})});
  WindowCanvas uneven(kScreen, {74, 111});
  uneven.update(painter.picture(), {kAll});
  EXPECT_EQ(pictureOf(uneven.pixels()).inkIn({0, 0, 74, 111}, kWhite), 0);
}

}  // namespace
}  // namespace brimol::pc
