/// Antialiased shapes. What they colour of a pixel does not depend on `clip`, so that a picture
/// painted in parts equals one painted at once. Every `clip` lies within the canvas.
#pragma once

#include "canvas.h"
#include "polygon.h"

namespace brimol::pc {

/// A box with round corners.
void fillRoundBox(const Canvas& canvas, const Edges& box, uint32_t color, const Pixels& clip);

/// A polygon cut to `limits`, which lie within the canvas.
struct CutPolygon {
  Polygon outline;
  Pixels limits;
};
void fillPolygon(const Canvas& canvas, const CutPolygon& polygon, uint32_t color,
                 const Pixels& clip);

/// What stands where a picture is missing: an outline with a diagonal.
void drawMissingPicture(const Canvas& canvas, const Edges& box, const Pixels& clip);

}  // namespace brimol::pc
