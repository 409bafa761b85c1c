#include "painting.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>

namespace brimol::pc {

namespace {
constexpr uint32_t kRgb = 0x00FFFFFF;
}

SKIA_Text textOf(std::string_view words, int32_t size, uint32_t color, int32_t align) {
  SKIA_Text text = {};
  words.copy(text.text, SKIA_TEXT_BYTES - 1);
  text.string_len = static_cast<int32_t>(words.size());
  text.size = size;
  text.color = color;
  text.align = align;
  return text;
}

SKIA_Item boxItem(SKIA_Rect rect, int32_t kind) { return {kind, rect, {}, {}}; }

SKIA_Item textItem(int32_t kind, SKIA_Rect rect, const SKIA_Text& text) {
  return {kind, rect, {}, text};
}

SKIA_Item lineItem(SKIA_Point line) { return {SKIA_LINE, {}, line, {}}; }

SKIA_Item arrowItem(SKIA_Rect rect, uint32_t color, int32_t direction) {
  return {SKIA_ARROW, rect, {0, 0, 0, 0, color, direction}, {}};
}

int Picture::inkIn(const cairo_rectangle_int_t& area, uint32_t color) const {
  int count = 0;
  for (int y = area.y; y < area.y + area.height; ++y) {
    for (int x = area.x; x < area.x + area.width; ++x) count += at(x, y) != (color & kRgb) ? 1 : 0;
  }
  return count;
}

cairo_rectangle_int_t Picture::inked() const {
  int left = size.w;
  int top = size.h;
  int right = 0;
  int bottom = 0;
  for (int y = 0; y < size.h; ++y) {
    for (int x = 0; x < size.w; ++x) {
      if (at(x, y) == 0) continue;
      left = std::min(left, x);
      top = std::min(top, y);
      right = std::max(right, x + 1);
      bottom = std::max(bottom, y + 1);
    }
  }
  return {left, top, right - left, bottom - top};
}

Picture pictureOf(cairo_surface_t* surface) {
  cairo_surface_flush(surface);
  Picture picture = {
      {cairo_image_surface_get_width(surface), cairo_image_surface_get_height(surface)}, {}};
  const unsigned char* const data = cairo_image_surface_get_data(surface);
  const std::ptrdiff_t stride = cairo_image_surface_get_stride(surface);
  for (int y = 0; y < picture.size.h; ++y) {
    for (int x = 0; x < picture.size.w; ++x) {
      uint32_t pixel = 0;
      std::memcpy(&pixel, data + y * stride + x * static_cast<std::ptrdiff_t>(sizeof pixel),
                  sizeof pixel);
      picture.pixels.push_back(pixel & kRgb);
    }
  }
  return picture;
}

Picture painted(const Frame& frame, Size screen) {
  Painter painter(screen);
  painter.paint(frame);
  return pictureOf(painter.picture());
}

std::string writePicture(const std::string& name, Size size, uint32_t color) {
  std::string path = testing::TempDir() + "/" +
                     testing::UnitTest::GetInstance()->current_test_info()->name() + name;
  const CairoSurface surface(cairo_image_surface_create(CAIRO_FORMAT_RGB24, size.w, size.h));
  const CairoContext context(cairo_create(surface.get()));
  constexpr double kFull = 255;
  cairo_set_source_rgb(context.get(), (color >> 16 & 0xFF) / kFull, (color >> 8 & 0xFF) / kFull,
                       (color & 0xFF) / kFull);
  cairo_paint(context.get());
  EXPECT_EQ(cairo_surface_write_to_png(surface.get(), path.c_str()), CAIRO_STATUS_SUCCESS);
  return path;
}

}  // namespace brimol::pc

bool operator==(const cairo_rectangle_int_t& one, const cairo_rectangle_int_t& other) {
  return one.x == other.x && one.y == other.y && one.width == other.width &&
         one.height == other.height;
}

void PrintTo(const cairo_rectangle_int_t& area, std::ostream* out) {
  *out << area.x << "," << area.y << " " << area.width << "x" << area.height;
}
