/// Antialiased shapes.
#pragma once

#include "painter/canvas.h"
#include "scene/polygon.h"

namespace brimol::pc {

/// A colour, and the part of a canvas that it may touch. How much of a pixel a shape colours does
/// not depend on `clip`, so that a picture painted in parts equals one painted at once.
struct Brush {
  const Canvas& canvas;
  Pixels clip;  // within the canvas
  uint32_t color;

  void fill(const Edges& area) const;
  void cover(int64_t x, int64_t y, int coverage) const;
};

/// A box with round corners.
void fillRoundBox(const Brush& brush, const Edges& box);

/// The rows of a box with round corners between its corners: all of their pixels are its own.
Edges fullRowsOf(const Edges& box);

/// The part of a polygon that lies in `limits`, which lie within the canvas.
void fillPolygon(const Brush& brush, const Polygon& polygon, const Pixels& limits);

/// What stands where a picture is missing: an outline with a diagonal, in a colour of its own.
void drawMissingPicture(const Canvas& canvas, const Edges& box, const Pixels& clip);

}  // namespace brimol::pc
