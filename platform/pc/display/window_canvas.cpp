#include "display/window_canvas.h"

#include <cstddef>

#include "scene/new_picture.h"

namespace brimol::pc {
namespace {

constexpr int kPixelBytes = 4;

// Disjoint, though the parts of `changed` may meet in one window pixel.
Region toWindow(const WindowFit& fit, const Region& changed) {
  const CairoRegion touched(cairo_region_create());
  for (const cairo_rectangle_int_t& part : changed) {
    const cairo_rectangle_int_t inWindow = fit.toWindow(part);
    cairo_region_union_rectangle(touched.get(), &inWindow);
  }
  Region parts(static_cast<std::size_t>(cairo_region_num_rectangles(touched.get())));
  int index = 0;
  for (cairo_rectangle_int_t& part : parts) {
    cairo_region_get_rectangle(touched.get(), index++, &part);
  }
  return parts;
}

}  // namespace

WindowCanvas::WindowCanvas(Size screen, Size window)
    : placement(WindowFit::of(screen, window)),
      scaler(screen, {placement.shown.width, placement.shown.height}),
      content(newPicture(placement.window)) {}

Region WindowCanvas::update(cairo_surface_t* picture, const Region& changed) {
  Region parts = toWindow(placement, changed);
  const cairo_rectangle_int_t& shown = placement.shown;
  const int stride = cairo_image_surface_get_stride(content.get());
  unsigned char* const origin = cairo_image_surface_get_data(content.get()) +
                                std::ptrdiff_t{shown.y} * stride +
                                std::ptrdiff_t{shown.x} * kPixelBytes;
  for (const cairo_rectangle_int_t& part : parts) {
    scaler.scale(picture, {part.x - shown.x, part.y - shown.y, part.width, part.height}, origin,
                 stride);
  }
  return parts;
}

}  // namespace brimol::pc
