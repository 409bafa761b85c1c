#include "painter/glyph_images.h"

#include <pango/pangocairo.h>

#include <algorithm>
#include <iterator>

#include "painter/canvas.h"

namespace brimol::pc {

namespace {

constexpr uint32_t kWhite = 0xFFFFFFFF;
constexpr uint32_t kByte = 0xFF;
constexpr int kGroup = CoveredGroup::kPixels;

// The pixels that a glyph can touch: its edges are smooth.
Pixels touched(PangoFont* font, PangoGlyph glyph) {
  constexpr int kSlack = 2;
  PangoRectangle ink = {};
  pango_font_get_glyph_extents(font, glyph, &ink, nullptr);
  if (ink.width <= 0 || ink.height <= 0) return {};
  const int left = PANGO_PIXELS_FLOOR(ink.x) - kSlack;
  const int top = PANGO_PIXELS_FLOOR(ink.y) - kSlack;
  return {left, top, PANGO_PIXELS_CEIL(ink.x + ink.width) + kSlack - left,
          PANGO_PIXELS_CEIL(ink.y + ink.height) + kSlack - top};
}

GlyphImage imageOf(PangoFont* font, PangoGlyph glyph) {
  const Pixels area = touched(font, glyph);
  if (isEmpty(area)) return {};
  const PlacedGlyph placed = {glyph, 0, 0};
  return {coverageOf(font, {&placed, 1}, area), area};
}

// The smallest area around the pixels of `bounds` that are not 0.
Pixels inked(std::span<const uint8_t> coverage, const Pixels& bounds) {
  Edges edges = {bounds.width, bounds.height, 0, 0};
  for (int y = 0, i = 0; y < bounds.height; ++y) {
    for (int x = 0; x < bounds.width; ++x, ++i) {
      if (coverage[static_cast<std::size_t>(i)] == 0) continue;
      edges = {std::min<int64_t>(edges.left, x), std::min<int64_t>(edges.top, y),
               std::max<int64_t>(edges.right, x + 1), y + 1};
    }
  }
  Pixels area = within(edges, {0, 0, bounds.width, bounds.height});
  area.x += bounds.x;
  area.y += bounds.y;
  return area;
}

}  // namespace

GlyphImage::GlyphImage(std::span<const uint8_t> coverage, const Pixels& bounds)
    : box(inked(coverage, bounds)) {
  rows.push_back(0);
  for (int y = 0; y < box.height; ++y) {
    const int first = (box.y - bounds.y + y) * bounds.width + box.x - bounds.x;
    const auto row =
        coverage.subspan(static_cast<std::size_t>(first), static_cast<std::size_t>(box.width));
    for (std::size_t x = 0; x < row.size(); ++x) {
      if (row[x] == 0) continue;
      CoveredGroup group = {static_cast<uint16_t>(x), {}};
      std::ranges::copy(row.subspan(x, std::min<std::size_t>(kGroup, row.size() - x)),
                        group.coverage.begin());
      groups.push_back(group);
      x += kGroup - 1;
    }
    rows.push_back(static_cast<uint32_t>(groups.size()));
  }
}

void GlyphImages::trim() {
  if (total <= kMostBytes) return;
  sheets.clear();
  latest = nullptr;
  total = 0;
}

const GlyphImage& GlyphImages::of(PangoFont* font, PangoGlyph glyph) {
  Sheet& sheet = sheetOf(font);
  if (glyph >= sheet.images.size()) {
    total += (glyph + 1 - sheet.images.size()) * sizeof sheet.images[0];
    sheet.images.resize(glyph + 1);
  }
  std::unique_ptr<GlyphImage>& image = sheet.images[glyph];
  if (!image) {
    image = std::make_unique<GlyphImage>(imageOf(font, glyph));
    total += image->bytes();
  }
  return *image;
}

GlyphImages::Sheet& GlyphImages::sheetOf(PangoFont* font) {
  if (latest != nullptr && latest->font.get() == font) return *latest;
  const auto [place, isNew] = sheets.try_emplace(font);
  if (isNew) place->second.font.reset(PANGO_FONT(g_object_ref(font)));
  latest = &place->second;
  return *latest;
}

// In black on white, as on a canvas: what a pixel lacks of white is its coverage.
std::vector<uint8_t> coverageOf(PangoFont* font, std::span<const PlacedGlyph> glyphs,
                                const Pixels& area) {
  const Canvas paper({area.width, area.height});
  paper.fill(wholeOf(paper.size()), kWhite);
  cairo_t* const context = paper.context();
  cairo_set_source_rgb(context, 0, 0, 0);
  cairo_set_scaled_font(context, pango_cairo_font_get_scaled_font(PANGO_CAIRO_FONT(font)));
  cairo_translate(context, -area.x, -area.y);
  cairo_show_glyphs(context, glyphs.data(), static_cast<int>(glyphs.size()));
  cairo_surface_flush(paper.surface());
  std::vector<uint8_t> coverage;
  for (int y = 0; y < paper.size().h; ++y) {
    const std::span row(paper.row(y), static_cast<std::size_t>(paper.size().w));
    std::ranges::transform(row, std::back_inserter(coverage), [](uint32_t pixel) {
      return static_cast<uint8_t>(kByte - (pixel & kByte));
    });
  }
  coverage.resize(static_cast<std::size_t>(area.width) * static_cast<std::size_t>(area.height));
  return coverage;
}

}  // namespace brimol::pc
