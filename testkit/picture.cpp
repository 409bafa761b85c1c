#include <brimol3_widget_test/picture.h>

#include <algorithm>
#include <iterator>
#include <stdexcept>

#include "painter/painter.h"
#include "scene/cairo_handles.h"

namespace brimol::test {

namespace {

constexpr uint32_t kRgb = 0x00FFFFFF;

// Between rows of 32-bit pixels there is no gap.
Picture pictureOf(cairo_surface_t* surface) {
  cairo_surface_flush(surface);
  Picture picture{
      {cairo_image_surface_get_width(surface), cairo_image_surface_get_height(surface)}};
  const auto count =
      static_cast<std::size_t>(picture.size.width) * static_cast<std::size_t>(picture.size.height);
  const auto* const pixels =
      reinterpret_cast<const uint32_t*>(cairo_image_surface_get_data(surface));
  std::transform(pixels, pixels + count, std::back_inserter(picture.pixels),
                 [](uint32_t pixel) { return pixel & kRgb; });
  return picture;
}

}  // namespace

uint32_t Picture::at(int x, int y) const {
  const bool isInside = x >= 0 && y >= 0 && x < size.width && y < size.height;
  if (!isInside) throw std::out_of_range("a place outside the picture");
  return pixels.at(static_cast<std::size_t>(y) * static_cast<std::size_t>(size.width) +
                   static_cast<std::size_t>(x));
}

Picture paint(const Frame& frame, ScreenSize size) {
  pc::Painter painter({size.width, size.height});
  painter.paint(frame);
  return pictureOf(painter.picture());
}

Picture readPicture(const std::filesystem::path& file) {
  const pc::CairoSurface read(cairo_image_surface_create_from_png(file.c_str()));
  if (cairo_surface_status(read.get()) != CAIRO_STATUS_SUCCESS) return {};
  // Whatever the file's own format.
  const int width = cairo_image_surface_get_width(read.get());
  const int height = cairo_image_surface_get_height(read.get());
  const pc::CairoSurface plain(cairo_image_surface_create(CAIRO_FORMAT_RGB24, width, height));
  const pc::CairoContext context(cairo_create(plain.get()));
  cairo_set_source_surface(context.get(), read.get(), 0, 0);
  cairo_paint(context.get());
  return pictureOf(plain.get());
}

bool writePicture(const Picture& picture, const std::filesystem::path& file) {
  Picture copy = picture;
  const pc::CairoSurface surface(cairo_image_surface_create_for_data(
      reinterpret_cast<unsigned char*>(copy.pixels.data()), CAIRO_FORMAT_RGB24, copy.size.width,
      copy.size.height, copy.size.width * static_cast<int>(sizeof(uint32_t))));
  return cairo_surface_write_to_png(surface.get(), file.c_str()) == CAIRO_STATUS_SUCCESS;
}

}  // namespace brimol::test
