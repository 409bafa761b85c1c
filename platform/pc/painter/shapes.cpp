#include "painter/shapes.h"

#include <cmath>

namespace brimol::pc {

namespace {

constexpr int64_t kSidesPerRadius = 5;  // the radius is this part of the box's smaller side
constexpr int64_t kMostRadius = 40;     // pixels
constexpr int kFullCoverage = 255;
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
  return static_cast<int>(std::lround(std::clamp(inside + 0.5F, 0.0F, 1.0F) * kFullCoverage));
}

// Fills a row through two of the corners, which lies `depth` rows from the nearer edge.
void fillCornerRow(const Brush& brush, const Edges& row, int64_t depth, int64_t radius) {
  int64_t indent = 0;
  for (; indent < radius; ++indent) {
    const int coverage = cornerCoverage(indent, depth, radius);
    if (coverage == kFullCoverage) break;
    brush.cover(row.left + indent, row.top, coverage);
    brush.cover(row.right - 1 - indent, row.top, coverage);
  }
  brush.fill({row.left + indent, row.top, row.right - indent, row.bottom});
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

void Brush::fill(const Edges& area) const {
  const Pixels pixels = within(area, clip);
  if (!isEmpty(pixels)) canvas.fill(pixels, color);
}

void Brush::cover(int64_t x, int64_t y, int coverage) const {
  const Pixels pixel = within(Edges{x, y, x + 1, y + 1}, clip);
  if (!isEmpty(pixel)) canvas.cover(pixel.x, pixel.y, color, coverage);
}

Edges fullRowsOf(const Edges& box) {
  const int64_t radius = radiusOf(box);
  return {box.left, box.top + radius, box.right, box.bottom - radius};
}

void fillRoundBox(const Brush& brush, const Edges& box) {
  const int64_t radius = radiusOf(box);
  brush.fill(fullRowsOf(box));
  const Edges rows = edgesOf(within(box, brush.clip));
  for (int64_t y = rows.top; y < rows.bottom; ++y) {
    const int64_t depth = std::min(y - box.top, box.bottom - 1 - y);
    if (depth < radius) fillCornerRow(brush, {box.left, y, box.right, y + 1}, depth, radius);
  }
}

void fillPolygon(const Brush& brush, const Polygon& polygon, const Pixels& limits) {
  const Polygon outline = within(polygon, limits);
  const Pixels bounds = boundsOf(outline, limits);
  const Pixels area = within(bounds, brush.clip);
  if (isEmpty(area)) return;
  const CairoSurface mask = maskOf(outline, bounds);
  if (cairo_surface_status(mask.get()) != CAIRO_STATUS_SUCCESS) return;
  brush.canvas.cover(area, bounds, mask.get(), brush.color);
}

void drawMissingPicture(const Canvas& canvas, const Edges& box, const Pixels& clip) {
  const Brush brush = {canvas, clip, kMissingColor};
  const Edges hole = inset(box, kMissingLine);
  brush.fill({box.left, box.top, box.right, std::min(hole.top, box.bottom)});
  brush.fill({box.left, std::max(hole.bottom, box.top), box.right, box.bottom});
  brush.fill({box.left, hole.top, std::min(hole.left, box.right), hole.bottom});
  brush.fill({std::max(hole.right, box.left), hole.top, box.right, hole.bottom});
  const Spot corner = {static_cast<double>(box.left), static_cast<double>(box.top)};
  const Spot opposite = {static_cast<double>(box.right), static_cast<double>(box.bottom)};
  fillPolygon(brush, strokeOutline(corner, opposite, kMissingLine),
              within(box, wholeOf(canvas.size())));
}

}  // namespace brimol::pc
