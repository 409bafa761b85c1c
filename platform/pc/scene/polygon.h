/// The outlines of lines and arrows.
#pragma once

#include <brimol/scene.h>

#include <vector>

#include "scene/rectangles.h"

namespace brimol::pc {

/// A place on the screen, in pixels; whole numbers are the corners of pixels.
struct Spot {
  double x;
  double y;
};

using Polygon = std::vector<Spot>;

/// The outline of a stroke from one spot to another, its ends cut straight. `width` is in pixels.
/// No length: no outline.
Polygon strokeOutline(Spot from, Spot to, double width);

/// A line record's stroke; a width below 1 is 1. Level and upright lines lie on whole pixels.
Polygon lineOutline(const SKIA_Point& line);

bool isAxisAligned(const SKIA_Point& line);

/// An arrow as long as the rectangle is wide, in the middle of its height.
Polygon rightArrowOutline(const Edges& rect);
Polygon leftArrowOutline(const Edges& rect);

/// The part of `outline` in `limits`.
Polygon within(const Polygon& outline, const Pixels& limits);

/// The pixels in `limits` that `outline` can touch.
Pixels boundsOf(const Polygon& outline, const Pixels& limits);

}  // namespace brimol::pc
