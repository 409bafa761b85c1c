/// Rectangles of pixels, and records' rectangles of any size cut to them.
#pragma once

#include <brimol/scene.h>

#include <algorithm>
#include <cstdint>

#include "scene/geometry.h"

namespace brimol::pc {

using Pixels = cairo_rectangle_int_t;

/// A rectangle by its edges, right and bottom one past it: wide enough for every record's words.
struct Edges {
  int64_t left;
  int64_t top;
  int64_t right;
  int64_t bottom;
};

/// A rectangle of negative or no width or height is empty: its right or bottom edge lies before
/// the other.
constexpr Edges edgesOf(const SKIA_Rect& rect) {
  return {rect.x, rect.y, int64_t{rect.x} + rect.w, int64_t{rect.y} + rect.h};
}

constexpr Edges edgesOf(const Pixels& area) {
  return {area.x, area.y, int64_t{area.x} + area.width, int64_t{area.y} + area.height};
}

constexpr Edges inset(const Edges& edges, int64_t by) {
  return {edges.left + by, edges.top + by, edges.right - by, edges.bottom - by};
}

constexpr bool isEmpty(const Edges& edges) {
  return edges.right <= edges.left || edges.bottom <= edges.top;
}

constexpr bool isEmpty(const Pixels& area) { return area.width <= 0 || area.height <= 0; }

/// The part of `edges` that lies in `limits`; where there is none, a rectangle without size.
constexpr Pixels within(const Edges& edges, const Pixels& limits) {
  const Edges bounds = edgesOf(limits);
  const int64_t left = std::max(edges.left, bounds.left);
  const int64_t top = std::max(edges.top, bounds.top);
  const int64_t width = std::min(edges.right, bounds.right) - left;
  const int64_t height = std::min(edges.bottom, bounds.bottom) - top;
  if (width <= 0 || height <= 0) return {};
  return {static_cast<int>(left), static_cast<int>(top), static_cast<int>(width),
          static_cast<int>(height)};
}

constexpr Pixels within(const Pixels& area, const Pixels& limits) {
  return within(edgesOf(area), limits);
}

constexpr bool covers(const Edges& outer, const Pixels& area) {
  const Edges inner = edgesOf(area);
  return outer.left <= inner.left && outer.top <= inner.top && outer.right >= inner.right &&
         outer.bottom >= inner.bottom;
}

constexpr Pixels wholeOf(Size screen) { return {0, 0, screen.w, screen.h}; }

static_assert(within(edgesOf(SKIA_Rect{INT32_MAX - 1, 5, INT32_MAX, 10, 0}), Pixels{0, 0, 100, 100})
                  .width == 0);
static_assert(within(Edges{-10, 90, 20, 300}, Pixels{0, 0, 100, 100}).width == 20);

}  // namespace brimol::pc
