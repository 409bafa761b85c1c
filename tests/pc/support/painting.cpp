#include "pc/support/painting.h"

#include <algorithm>
#include <cstring>
#include <tuple>

#include "scene/cairo_handles.h"

namespace brimol::pc {

namespace {
constexpr uint32_t kRgb = 0x00FFFFFF;
}

SKIA_Text textOf(std::string_view words, int32_t size, uint32_t color, int32_t align) {
  SKIA_Text text = {{}, static_cast<int32_t>(words.size()), color, align, size};
  words.copy(text.text, SKIA_TEXT_BYTES - 1);
  return text;
}

int Picture::inkIn(const Area& area, uint32_t color) const {
  int count = 0;
  for (int y = area.y; y < area.y + area.height; ++y) {
    for (int x = area.x; x < area.x + area.width; ++x) count += at(x, y) != (color & kRgb) ? 1 : 0;
  }
  return count;
}

Area Picture::inked() const {
  Area area = {0, 0, size.w, size.h};
  while (area.height > 0 && inkIn({0, area.y, size.w, 1}) == 0) ++area.y, --area.height;
  while (area.height > 0 && inkIn({0, area.y + area.height - 1, size.w, 1}) == 0) --area.height;
  while (area.width > 0 && inkIn({area.x, 0, 1, size.h}) == 0) ++area.x, --area.width;
  while (area.width > 0 && inkIn({area.x + area.width - 1, 0, 1, size.h}) == 0) --area.width;
  return area;
}

Picture pictureOf(cairo_surface_t* surface) {
  cairo_surface_flush(surface);
  const Size size = {cairo_image_surface_get_width(surface),
                     cairo_image_surface_get_height(surface)};
  Picture picture = {size, std::vector<uint32_t>(static_cast<std::size_t>(size.w) *
                                                 static_cast<std::size_t>(size.h))};
  // Between rows of 32-bit pixels there is no gap.
  std::memcpy(picture.pixels.data(), cairo_image_surface_get_data(surface),
              picture.pixels.size() * sizeof kRgb);
  for (uint32_t& pixel : picture.pixels) pixel &= kRgb;
  return picture;
}

Picture painted(const Frame& frame, Size screen) {
  Painter painter(screen);
  painter.paint(frame);
  return pictureOf(painter.picture());
}

}  // namespace brimol::pc

bool operator==(const cairo_rectangle_int_t& one, const cairo_rectangle_int_t& other) {
  return std::tie(one.x, one.y, one.width, one.height) ==
         std::tie(other.x, other.y, other.width, other.height);
}
