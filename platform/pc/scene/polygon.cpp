#include "scene/polygon.h"

#include <array>
#include <cmath>

namespace brimol::pc {

namespace {

constexpr double kHeadPart = 0.5;    // the arrow head's length, and half its height, of its side
constexpr double kShaftPart = 0.15;  // half the shaft's height, of the same side

// An edge of a rectangle: inside is where x * `x` + y * `y` is at most `limit`.
struct HalfPlane {
  double x;
  double y;
  double limit;
  double distance(Spot spot) const { return spot.x * x + spot.y * y - limit; }
};

Spot crossing(Spot from, Spot to, const HalfPlane& plane) {
  const double before = plane.distance(from);
  const double part = before / (before - plane.distance(to));
  return {from.x + (to.x - from.x) * part, from.y + (to.y - from.y) * part};
}

Polygon cut(const Polygon& outline, const HalfPlane& plane) {
  Polygon kept;
  for (std::size_t i = 0; i < outline.size(); ++i) {
    const Spot from = outline[i];
    const Spot to = outline[(i + 1) % outline.size()];
    const bool isFromInside = plane.distance(from) <= 0;
    const bool isToInside = plane.distance(to) <= 0;
    if (isFromInside) kept.push_back(from);
    if (isFromInside != isToInside) kept.push_back(crossing(from, to, plane));
  }
  return kept;
}

Polygon alignedOutline(const SKIA_Point& line, int64_t width) {
  const bool isLevel = line.y1 == line.y2;
  const int64_t across = (isLevel ? line.y1 : line.x1) - width / 2;
  const auto [first, last] =
      isLevel ? std::minmax(line.x1, line.x2) : std::minmax(line.y1, line.y2);
  if (first == last) return {};
  const auto low = static_cast<double>(across);
  const auto high = static_cast<double>(across + width);
  const double start = first;
  const double end = last;
  if (isLevel) return {{start, low}, {end, low}, {end, high}, {start, high}};
  return {{low, start}, {high, start}, {high, end}, {low, end}};
}

struct ArrowShape {
  double tail;
  double tip;
  double middle;
  double side;  // room for the head, positive where it points right
};

Polygon arrowOutline(const ArrowShape& shape) {
  const double neck = shape.tip - shape.side * kHeadPart;
  const double head = std::abs(shape.side) * kHeadPart;
  const double shaft = std::abs(shape.side) * kShaftPart;
  return {{shape.tail, shape.middle - shaft}, {neck, shape.middle - shaft},
          {neck, shape.middle - head},        {shape.tip, shape.middle},
          {neck, shape.middle + head},        {neck, shape.middle + shaft},
          {shape.tail, shape.middle + shaft}};
}

double middleOf(const Edges& rect) { return static_cast<double>(rect.top + rect.bottom) / 2; }

double smallerSide(const Edges& rect) {
  return static_cast<double>(std::min(rect.right - rect.left, rect.bottom - rect.top));
}

}  // namespace

Polygon strokeOutline(Spot from, Spot to, double width) {
  const double length = std::hypot(to.x - from.x, to.y - from.y);
  if (length == 0) return {};
  const double x = (from.y - to.y) / length * width / 2;
  const double y = (to.x - from.x) / length * width / 2;
  return {{from.x + x, from.y + y},
          {to.x + x, to.y + y},
          {to.x - x, to.y - y},
          {from.x - x, from.y - y}};
}

bool isAxisAligned(const SKIA_Point& line) { return line.x1 == line.x2 || line.y1 == line.y2; }

Polygon lineOutline(const SKIA_Point& line) {
  const int32_t width = std::max(line.width, 1);
  if (isAxisAligned(line)) return alignedOutline(line, width);
  return strokeOutline({static_cast<double>(line.x1), static_cast<double>(line.y1)},
                       {static_cast<double>(line.x2), static_cast<double>(line.y2)}, width);
}

Polygon rightArrowOutline(const Edges& rect) {
  return arrowOutline({static_cast<double>(rect.left), static_cast<double>(rect.right),
                       middleOf(rect), smallerSide(rect)});
}

Polygon leftArrowOutline(const Edges& rect) {
  return arrowOutline({static_cast<double>(rect.right), static_cast<double>(rect.left),
                       middleOf(rect), -smallerSide(rect)});
}

Polygon within(const Polygon& outline, const Pixels& limits) {
  const Edges edges = edgesOf(limits);
  const auto planes = std::to_array<HalfPlane>({
      {-1, 0, -static_cast<double>(edges.left)},
      {1, 0, static_cast<double>(edges.right)},
      {0, -1, -static_cast<double>(edges.top)},
      {0, 1, static_cast<double>(edges.bottom)},
  });
  Polygon rest = outline;
  for (const HalfPlane& plane : planes) rest = cut(rest, plane);
  return rest;
}

Pixels boundsOf(const Polygon& outline, const Pixels& limits) {
  if (outline.empty()) return {};
  const auto [left, right] = std::ranges::minmax(outline, {}, &Spot::x);
  const auto [top, bottom] = std::ranges::minmax(outline, {}, &Spot::y);
  // Doubles of any size become words only after they are rounded: the outlines come from words.
  return within(
      Edges{static_cast<int64_t>(std::floor(left.x)), static_cast<int64_t>(std::floor(top.y)),
            static_cast<int64_t>(std::ceil(right.x)), static_cast<int64_t>(std::ceil(bottom.y))},
      limits);
}

}  // namespace brimol::pc
