#include "painter/laid_text.h"

#include <pango/pangocairo.h>

#include <algorithm>

#include "painter/fonts.h"

namespace brimol::pc {

namespace {

constexpr int kFarAway = 1'000'000;  // pixels; no text reaches from there to a screen

int pixelsOf(int pangoUnits) { return PANGO_PIXELS(pangoUnits); }

// Where something of `size` pixels lies in the room from `low` to `high`.
int64_t centred(int64_t low, int64_t high, int size) { return low + (high - low - size) / 2; }

int64_t aligned(const Edges& box, int align, int width) {
  if (align == SKIA_ALIGN_RIGHT) return box.right - width;
  if (align == SKIA_ALIGN_CENTRE) return centred(box.left, box.right, width);
  return box.left;
}

bool isNear(int64_t position) { return position >= -kFarAway && position <= kFarAway; }

Edges around(const Edges& one, const Edges& other) {
  return {std::min(one.left, other.left), std::min(one.top, other.top),
          std::max(one.right, other.right), std::max(one.bottom, other.bottom)};
}

std::span<const PangoGlyphInfo> glyphsOf(const PangoGlyphString* glyphs) {
  return {glyphs->glyphs, static_cast<std::size_t>(glyphs->num_glyphs)};
}

// Pango draws a box with numbers for a character without a glyph: no glyphs, so no mask.
bool hasAllGlyphs(const PangoGlyphString* glyphs) {
  return std::ranges::none_of(glyphsOf(glyphs), [](const PangoGlyphInfo& info) {
    return info.glyph != PANGO_GLYPH_EMPTY && (info.glyph & PANGO_GLYPH_UNKNOWN_FLAG) != 0;
  });
}

// What shows a run that begins `start` Pango units from its line's left end. False where Pango must
// draw it.
bool resolve(const PangoGlyphItem& item, int start, GlyphRun& run) {
  if (!hasAllGlyphs(item.glyphs)) return false;
  run.begin(item.item->analysis.font);
  start += item.start_x_offset;
  for (const PangoGlyphInfo& info : glyphsOf(item.glyphs)) {
    const PangoGlyphGeometry& geometry = info.geometry;
    if (info.glyph != PANGO_GLYPH_EMPTY)
      run.add(info.glyph, start + geometry.x_offset, geometry.y_offset - item.y_offset);
    start += geometry.width;
  }
  return run.resolve();
}

TextLayout layOut(PangoContext* context, std::string_view words, int size) {
  TextLayout layout(pango_layout_new(context));
  const FontDescription font = projectFonts(size);
  pango_layout_set_font_description(layout.get(), font.get());
  const std::unique_ptr<char, decltype(&g_free)> valid(
      g_utf8_make_valid(words.data(), static_cast<gssize>(words.size())), g_free);
  pango_layout_set_text(layout.get(), valid.get(), -1);
  return layout;
}

}  // namespace

LaidText::LaidText(const Sources& sources, std::string_view words, int size) {
  const PlainShapes::Sheet* const sheet = sources.shapes.sheetFor(words, size);
  if (sheet != nullptr && addPlainLine(*sheet, sources.run, words)) return;
  layout = layOut(sources.context, words, size);
  int units = 0;
  pango_layout_get_size(layout.get(), nullptr, &units);
  height = pixelsOf(units);
  const LayoutIterator iter(pango_layout_get_iter(layout.get()));
  do {
    addLine(iter.get(), sources.run);
  } while (pango_layout_iter_next_line(iter.get()) != FALSE);
  images.shrink_to_fit();
  const Line& first = lines.front();
  sources.shapes.learn(words, size, layout.get(), {height, first.middle, first.baseline});
  if (std::ranges::none_of(lines, &Line::isByPango)) layout.reset();
}

// False, and nothing is added, where Pango must draw the line.
bool LaidText::addPlainLine(const PlainShapes::Sheet& sheet, GlyphRun& run,
                            std::string_view words) {
  run.begin(sheet.font());
  int x = 0;
  for (std::size_t i = 0; i < words.size(); ++i) {
    run.add(sheet.glyph(words[i]), x, 0);
    x += sheet.advance(words[i], i + 1 < words.size() ? words[i + 1] : '\0');
  }
  if (!run.resolve()) return false;
  images = run.images();
  const LineMetrics& metrics = sheet.metrics();
  height = metrics.height;
  lines.push_back({metrics.middle, metrics.baseline, pixelsOf(x), false, images.size()});
  return true;
}

void LaidText::addLine(PangoLayoutIter* iter, GlyphRun& run) {
  PangoLayoutLine* const shaped = pango_layout_iter_get_line_readonly(iter);
  PangoRectangle extents = {};
  PangoRectangle letters = {};
  pango_layout_iter_get_line_extents(iter, nullptr, &extents);
  pango_layout_line_get_pixel_extents(shaped, &letters, nullptr);
  const bool isByPango = !addImages(*shaped, run);
  lines.push_back({pixelsOf(extents.y + extents.height / 2),
                   pixelsOf(pango_layout_iter_get_baseline(iter)),
                   pixelsOf(extents.width),
                   isByPango,
                   images.size(),
                   {letters.x, letters.y, letters.width, letters.height}});
}

// False, and nothing is added, where Pango must draw the line.
bool LaidText::addImages(const PangoLayoutLine& line, GlyphRun& run) {
  const std::size_t before = images.size();
  int start = 0;
  for (const GSList* each = line.runs; each != nullptr; each = each->next) {
    const auto& item = *static_cast<const PangoGlyphItem*>(each->data);
    if (!resolve(item, start, run)) {
      images.resize(before);
      return false;
    }
    images.insert(images.end(), run.images().begin(), run.images().end());
    start += item.start_x_offset + pango_glyph_string_get_width(item.glyphs) + item.end_x_offset;
  }
  return true;
}

// Visits the lines with the place of each one's left end on its baseline. Line by line, since each
// is aligned to the box and not to the longest of them. In a box with room for fewer lines, those
// whose middle lies outside are left out, and the others are whole. False: some are left out.
template <typename Visit>
bool LaidText::visit(const Edges& box, int align, Visit each) const {
  const int64_t top = centred(box.top, box.bottom, height);
  bool isWhole = true;
  for (std::size_t i = 0; i < lines.size(); ++i) {
    const int64_t middle = top + lines[i].middle;
    const int64_t x = aligned(box, align, lines[i].width);
    const int64_t y = top + lines[i].baseline;
    const bool isInBox = middle >= box.top && middle <= box.bottom;
    isWhole = isWhole && isInBox;
    if (isInBox && isNear(x) && isNear(y)) {
      each(i, PixelPlace{static_cast<int>(x), static_cast<int>(y)});
    }
  }
  return isWhole;
}

void LaidText::draw(const Canvas& canvas, const Edges& box, int align, Ink& ink,
                    const Pixels& clip) const {
  visit(box, align, [&](std::size_t i, const PixelPlace& place) {
    if (lines[i].isByPango) return drawByPango(canvas, i, place, ink.color(), clip);
    for (const auto& [image, corner] : imagesOf(i)) {
      image->draw(canvas, {place.x + corner.x, place.y + corner.y}, ink, clip);
    }
  });
}

std::optional<Edges> LaidText::drawnArea(const Edges& box, int align) const {
  if (std::ranges::any_of(lines, &Line::isByPango)) return std::nullopt;
  Edges area = {0, 0, 0, 0};
  visit(box, align, [&](std::size_t i, const PixelPlace& place) {
    for (const PlacedImage& placed : imagesOf(i)) {
      Pixels letter = placed.area();
      letter.x += place.x;
      letter.y += place.y;
      area = isEmpty(area) ? edgesOf(letter) : around(area, edgesOf(letter));
    }
  });
  return area;
}

std::span<const PlacedImage> LaidText::imagesOf(std::size_t line) const {
  const std::size_t first = line == 0 ? 0 : lines[line - 1].end;
  return std::span(images).subspan(first, lines[line].end - first);
}

TextInk LaidText::ink(const Edges& box, int align) const {
  TextInk found;
  found.isWhole = visit(box, align, [&](std::size_t i, const PixelPlace& place) {
    Pixels letters = lines[i].letters;
    if (letters.width == 0) return;
    letters.x += place.x;
    letters.y += place.y;
    found.area = isEmpty(found.area) ? edgesOf(letters) : around(found.area, edgesOf(letters));
  });
  return found;
}

void LaidText::drawByPango(const Canvas& canvas, std::size_t line, const PixelPlace& place,
                           uint32_t color, const Pixels& clip) const {
  constexpr double kFull = 255;
  const auto part = [color](int shift) { return (color >> shift & 0xFF) / kFull; };
  cairo_t* const context = canvas.context();
  cairo_save(context);
  cairo_rectangle(context, clip.x, clip.y, clip.width, clip.height);
  cairo_clip(context);
  cairo_set_source_rgba(context, part(16), part(8), part(0), part(24));
  cairo_move_to(context, place.x, place.y);
  pango_cairo_show_layout_line(
      context, pango_layout_get_line_readonly(layout.get(), static_cast<int>(line)));
  cairo_restore(context);
}

std::size_t LaidText::bytes() const {
  constexpr std::size_t kLayoutBytes = 8192;  // about what Pango keeps for a short text
  return sizeof *this + (layout ? kLayoutBytes : 0) + lines.capacity() * sizeof lines[0] +
         images.capacity() * sizeof images[0];
}

}  // namespace brimol::pc
