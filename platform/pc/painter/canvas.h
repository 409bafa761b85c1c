/// The picture's pixels, and the fills that go straight into them.
#pragma once

#include <cstdint>

#include "scene/cairo_handles.h"
#include "scene/rectangles.h"

namespace brimol::pc {

/// A CAIRO_FORMAT_RGB24 picture, black at first. Cairo draws into it through context(), which has
/// no clip outside a drawing call. One thread uses it.
class Canvas {
 public:
  /// Where there is no memory for `size`, the canvas has no size.
  explicit Canvas(Size size);

  Size size() const { return extent; }
  cairo_surface_t* surface() const { return picture.get(); }
  uint32_t* row(int y) const { return pixels + static_cast<std::ptrdiff_t>(y) * stride; }
  /// Ready for drawing after the canvas's own writes.
  cairo_t* context() const;

  /// Colours `area`, which lies within the canvas: 0xAARRGGBB, laid over what is there.
  void fill(const Pixels& area, uint32_t color) const;
  /// Colours one pixel of the canvas by `coverage`, 0 to 255.
  void cover(int x, int y, uint32_t color, int coverage) const;
  /// Colours the pixels in `area` by their coverage in `mask`, a CAIRO_FORMAT_A8 picture that
  /// covers `corner`. `area` lies within it and within the canvas.
  void cover(const Pixels& area, const Pixels& corner, cairo_surface_t* mask, uint32_t color) const;

 private:
  CairoSurface picture;
  CairoContext drawing;
  uint32_t* pixels;
  std::ptrdiff_t stride;  // pixels from one row to the next
  Size extent;
};

/// What fill() makes of a pixel: `color` laid over `below`, whose alpha byte is opaque.
uint32_t laidOver(uint32_t below, uint32_t color);

}  // namespace brimol::pc
