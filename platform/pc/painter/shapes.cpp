#include "shapes.h"

#include <array>
#include <cmath>

namespace brimol::pc {

namespace {

constexpr int64_t kSidesPerRadius = 5;  // the radius is this part of the box's smaller side
constexpr int64_t kMostRadius = 40;     // pixels
constexpr float kFullCoverage = 255;
constexpr uint32_t kMissingColor = 0xFF808080;
constexpr int kMissingLine = 2;  // pixels

int64_t radiusOf(const Edges& box) {
  const int64_t side = std::min(box.right - box.left, box.bottom - box.top);
  return std::min(side / kSidesPerRadius, kMostRadius);
}

// How much of the pixel that lies `x` columns and `y` rows from a corner of radius `radius` belongs
// to the box, 0 to 255.
int cornerCoverage(int64_t x, int64_t y, int64_t radius) {
  const float across = static_cast<float>(radius - x) - 0.5F;
  const float down = static_cast<float>(radius - y) - 0.5F;
  const float inside = static_cast<float>(radius) - std::sqrt(across * across + down * down);
  return static_cast<int>(std::clamp(inside + 0.5F, 0.0F, 1.0F) * kFullCoverage + 0.5F);
}

void fillRowBetween(const Canvas& canvas, const Edges& row, uint32_t color, const Pixels& clip) {
  const Pixels area = within(row, clip);
  if (!isEmpty(area)) canvas.fill(area, color);
}

void coverIn(const Canvas& canvas, int64_t x, int y, uint32_t color, int coverage,
             const Pixels& clip) {
  if (x < clip.x || x >= int64_t{clip.x} + clip.width) return;
  canvas.cover(static_cast<int>(x), y, color, coverage);
}

// A row through two of the corners: `y` within `clip`, `depth` rows from the nearer edge.
struct CornerRow {
  int y;
  int64_t depth;
  int64_t radius;
};

void fillCornerRow(const Canvas& canvas, const Edges& box, const CornerRow& row, uint32_t color,
                   const Pixels& clip) {
  int64_t indent = 0;
  for (; indent < row.radius; ++indent) {
    const int coverage = cornerCoverage(indent, row.depth, row.radius);
    if (coverage == static_cast<int>(kFullCoverage)) break;
    coverIn(canvas, box.left + indent, row.y, color, coverage, clip);
    coverIn(canvas, box.right - 1 - indent, row.y, color, coverage, clip);
  }
  fillRowBetween(canvas, {box.left + indent, row.y, box.right - indent, int64_t{row.y} + 1}, color,
                 clip);
}

CairoSurface maskOf(const Polygon& outline, const Pixels& bounds) {
  CairoSurface mask(cairo_image_surface_create(CAIRO_FORMAT_A8, bounds.width, bounds.height));
  const CairoContext context(cairo_create(mask.get()));
  cairo_translate(context.get(), -bounds.x, -bounds.y);
  for (const Spot& spot : outline) cairo_line_to(context.get(), spot.x, spot.y);
  cairo_fill(context.get());
  cairo_surface_flush(mask.get());
  return mask;
}

}  // namespace

void fillRoundBox(const Canvas& canvas, const Edges& box, uint32_t color, const Pixels& clip) {
  const Pixels area = within(box, clip);
  const int64_t radius = radiusOf(box);
  fillRowBetween(canvas, {box.left, box.top + radius, box.right, box.bottom - radius}, color, clip);
  for (int y = area.y; y < area.y + area.height; ++y) {
    const int64_t depth = std::min(y - box.top, box.bottom - 1 - y);
    if (depth >= radius) continue;
    fillCornerRow(canvas, box, {y, depth, radius}, color, clip);
  }
}

void fillPolygon(const Canvas& canvas, const CutPolygon& polygon, uint32_t color,
                 const Pixels& clip) {
  const Polygon outline = within(polygon.outline, polygon.limits);
  const Pixels bounds = boundsOf(outline, polygon.limits);
  const Pixels area = within(bounds, clip);
  if (isEmpty(area)) return;
  const CairoSurface mask = maskOf(outline, bounds);
  if (cairo_surface_status(mask.get()) != CAIRO_STATUS_SUCCESS) return;
  canvas.cover(area, bounds, mask.get(), color);
}

void drawMissingPicture(const Canvas& canvas, const Edges& box, const Pixels& clip) {
  const Edges hole = inset(box, kMissingLine);
  const auto sides = std::to_array<Edges>({
      {box.left, box.top, box.right, std::min(hole.top, box.bottom)},
      {box.left, std::max(hole.bottom, box.top), box.right, box.bottom},
      {box.left, hole.top, std::min(hole.left, box.right), hole.bottom},
      {std::max(hole.right, box.left), hole.top, box.right, hole.bottom},
  });
  for (const Edges& side : sides) fillRowBetween(canvas, side, kMissingColor, clip);
  const auto left = static_cast<double>(box.left);
  const auto right = static_cast<double>(box.right);
  const auto top = static_cast<double>(box.top);
  const auto bottom = static_cast<double>(box.bottom);
  fillPolygon(canvas,
              {strokeOutline({left, top}, {right, bottom}, kMissingLine),
               within(box, wholeOf(canvas.size()))},
              kMissingColor, clip);
}

}  // namespace brimol::pc
