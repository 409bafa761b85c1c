/// The coverage of a glyph's pixels, kept to draw it in any colour.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include "painter/canvas.h"
#include "painter/ink.h"
#include "scene/rectangles.h"

namespace brimol::pc {

/// A pixel of the canvas, or beyond its edges.
struct PixelPlace {
  int x;
  int y;
};

/// A glyph's covered pixels around its origin: four pixels of a row wherever one of them is
/// covered. A blank has no area.
class GlyphImage {
 public:
  GlyphImage() = default;
  /// `coverage`: the pixels of `bounds` row by row, 0 to 255 each. At most kMostWidth columns.
  GlyphImage(std::span<const uint8_t> coverage, const Pixels& bounds);

  /// The smallest area that has all covered pixels.
  const Pixels& area() const { return box; }

  /// Of a row of the area, from 0 on, from left to right; places are counted from the area's left
  /// edge.
  std::span<const CoveredGroup> row(std::size_t number) const {
    return {groups.data() + rows[number], groups.data() + rows[number + 1]};
  }

  /// Draws with the area's corner at `corner` the pixels in `clip`, which lies within the canvas.
  void draw(const Canvas& canvas, const PixelPlace& corner, Ink& ink, const Pixels& clip);

  /// With the tint, which comes later.
  std::size_t bytes() const {
    return sizeof *this + groups.capacity() * (sizeof groups[0] + sizeof tint.pixels[0]) +
           rows.capacity() * sizeof rows[0];
  }

  static constexpr int kMostWidth = 65000;

 private:
  Pixels box = {};
  std::vector<CoveredGroup> groups;  // row by row, none over another
  std::vector<uint32_t> rows;        // where each row's groups begin, and where the last row's end
  Tint tint;
};

/// An image, and where its corner stands from a line's left end and baseline.
struct PlacedImage {
  GlyphImage* image;
  PixelPlace corner;

  Pixels area() const { return {corner.x, corner.y, image->area().width, image->area().height}; }
};

/// Whether a pixel is covered by both.
bool sharePixels(const PlacedImage& one, const PlacedImage& other);

}  // namespace brimol::pc
