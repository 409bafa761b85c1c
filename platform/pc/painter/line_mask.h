/// How much of each pixel a run of glyphs covers, kept to draw the run again in any colour.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include "painter/canvas.h"
#include "painter/glyph_images.h"
#include "painter/ink.h"

namespace brimol::pc {

/// A pixel of the canvas, or beyond its edges.
struct Place {
  int x;
  int y;
};

/// The coverage of one run of glyphs (glyph_run.h): four pixels of a row wherever one of them is
/// covered. Glyphs stand on whole pixels, so that a run is the same wherever its origin lies.
class LineMask {
 public:
  /// An image and the area that it covers, from the run's origin.
  struct Part {
    const GlyphImage* image;
    Pixels area;
  };

  /// The parts share no covered pixel and lie in `area`, which is at most kMostWidth wide.
  LineMask(std::span<const Part> parts, const Pixels& area);

  /// Draws the pixels in `clip`, which lies within the canvas.
  void draw(const Canvas& canvas, const Place& origin, Ink& ink, const Pixels& clip) const;

  std::size_t bytes() const {
    return groups.capacity() * sizeof groups[0] + rows.capacity() * sizeof rows[0];
  }

  static constexpr int kMostWidth = 65000;

 private:
  Pixels box;
  std::vector<CoveredGroup> groups;  // row by row
  std::vector<uint32_t> rows;        // where each row's groups begin, and where the last row's end
};

}  // namespace brimol::pc
