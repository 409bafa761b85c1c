#include "painter/glyph_images.h"

#include <pango/pangocairo.h>

#include <algorithm>
#include <iterator>
#include <utility>

#include "painter/canvas.h"

namespace brimol::pc {

namespace {

constexpr uint32_t kWhite = 0xFFFFFFFF;
constexpr uint32_t kByte = 0xFF;
constexpr std::size_t kNodeBytes = 96;  // about what a map adds to an entry

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

}  // namespace

GlyphImage& GlyphImages::of(PangoFont* font, PangoGlyph glyph) {
  auto& images = sheetOf(font).images;
  const auto known = images.find(glyph);
  if (known != images.end()) return known->second;
  GlyphImage& image = images.emplace(glyph, imageOf(font, glyph)).first->second;
  total += kNodeBytes + image.bytes();
  return image;
}

GlyphImages::Sum* GlyphImages::sumOf(const Pair& pair) {
  const auto known = sums.find(pair);
  return known == sums.end() ? nullptr : &known->second;
}

GlyphImages::Sum& GlyphImages::keepSum(const Pair& pair, Sum sum) {
  total += kNodeBytes + (sum ? sum->bytes() : 0);
  return sums.emplace(pair, std::move(sum)).first->second;
}

void GlyphImages::clear() {
  sums.clear();
  sheets.clear();
  latest = nullptr;
  total = 0;
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
