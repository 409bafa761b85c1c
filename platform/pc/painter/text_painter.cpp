#include "painter/text_painter.h"

#include <pango/pangocairo.h>

#include <algorithm>

#include "scene/item.h"

namespace brimol::pc {

namespace {

constexpr int kFarAway = 1'000'000;  // pixels; no text reaches from there to a screen

// Pango's colours have 16 bits for each of a colour's 8.
constexpr guint16 wide(uint32_t color, int shift) {
  constexpr uint32_t kByte = 0xFF;
  constexpr uint32_t kWiden = 257;
  return static_cast<guint16>((color >> shift & kByte) * kWiden);
}

AttributeList attributesOf(uint32_t color) {
  AttributeList attributes(pango_attr_list_new());
  pango_attr_list_insert(
      attributes.get(), pango_attr_foreground_new(wide(color, 16), wide(color, 8), wide(color, 0)));
  pango_attr_list_insert(attributes.get(), pango_attr_foreground_alpha_new(wide(color, 24)));
  return attributes;
}

int pixelsOf(int pangoUnits) { return PANGO_PIXELS(pangoUnits); }

// Where something of `size` pixels lies in the room from `low` to `high`.
int64_t centred(int64_t low, int64_t high, int size) { return low + (high - low - size) / 2; }

int64_t aligned(const Edges& box, int align, int width) {
  if (align == SKIA_ALIGN_RIGHT) return box.right - width;
  if (align == SKIA_ALIGN_CENTRE) return centred(box.left, box.right, width);
  return box.left;
}

bool isNear(int64_t position) { return position >= -kFarAway && position <= kFarAway; }

// Whether the text is one that draws something.
bool isDrawn(const SKIA_Text& text) {
  return textSizeOf(text) != 0 && alphaOf(text.color) != 0 && !shownText(text).empty();
}

// Visits the layout's lines with the place of each one's beginning on its baseline. Line by line,
// since each is aligned to the box and not to the longest of them. In a box with room for fewer lines,
// those whose middle lies outside are left out, and the others are whole. False: some are left out.
template <typename Visit>
bool visitLines(PangoLayout* layout, const Edges& box, int align, Visit visit) {
  int height = 0;
  pango_layout_get_size(layout, nullptr, &height);
  const int64_t top = centred(box.top, box.bottom, pixelsOf(height));
  const LayoutIterator iter(pango_layout_get_iter(layout));
  bool isWhole = true;
  do {
    PangoRectangle extents;
    pango_layout_iter_get_line_extents(iter.get(), nullptr, &extents);
    const int64_t middle = top + pixelsOf(extents.y + extents.height / 2);
    const int64_t x = aligned(box, align, pixelsOf(extents.width));
    const int64_t y = top + pixelsOf(pango_layout_iter_get_baseline(iter.get()));
    const bool isInBox = middle >= box.top && middle <= box.bottom;
    isWhole = isWhole && isInBox;
    if (isInBox && isNear(x) && isNear(y)) {
      visit(pango_layout_iter_get_line_readonly(iter.get()), x, y);
    }
  } while (pango_layout_iter_next_line(iter.get()) != FALSE);
  return isWhole;
}

Edges around(const Edges& one, const Edges& other) {
  if (isEmpty(one)) return other;
  return {std::min(one.left, other.left), std::min(one.top, other.top),
          std::max(one.right, other.right), std::max(one.bottom, other.bottom)};
}

}  // namespace

void TextPainter::draw(const Canvas& canvas, const SKIA_Rect& rect, const SKIA_Text& text,
                       const Pixels& clip) {
  if (!isDrawn(text)) return;
  PangoLayout* const layout = layoutOf(text);
  cairo_t* const context = canvas.context();
  cairo_save(context);
  cairo_rectangle(context, clip.x, clip.y, clip.width, clip.height);
  cairo_clip(context);
  visitLines(layout, edgesOf(rect), text.align, [&](PangoLayoutLine* line, int64_t x, int64_t y) {
    cairo_move_to(context, static_cast<double>(x), static_cast<double>(y));
    pango_cairo_show_layout_line(context, line);
  });
  cairo_restore(context);
}

TextInk TextPainter::inkOf(const SKIA_Rect& rect, const SKIA_Text& text) {
  TextInk ink;
  if (!isDrawn(text)) return ink;
  const auto add = [&ink](PangoLayoutLine* line, int64_t x, int64_t y) {
    PangoRectangle letters;
    pango_layout_line_get_pixel_extents(line, &letters, nullptr);
    if (letters.width == 0) return;
    const int64_t left = x + letters.x;
    const int64_t top = y + letters.y;
    ink.area = around(ink.area, {left, top, left + letters.width, top + letters.height});
  };
  ink.isWhole = visitLines(layoutOf(text), edgesOf(rect), text.align, add);
  return ink;
}

PangoLayout* TextPainter::layoutOf(const SKIA_Text& text) {
  Key key{std::string(shownText(text)), textSizeOf(text), text.color};
  if (const TextLayout* const known = layouts.find(key)) return known->get();
  TextLayout layout = makeLayout(key);
  return layouts.put(std::move(key), std::move(layout), 1).get();
}

TextLayout TextPainter::makeLayout(const Key& key) const {
  TextLayout layout(pango_layout_new(fonts->context()));
  const FontDescription font = projectFonts(key.size);
  pango_layout_set_font_description(layout.get(), font.get());
  const AttributeList attributes = attributesOf(key.color);
  pango_layout_set_attributes(layout.get(), attributes.get());
  const std::unique_ptr<char, decltype(&g_free)> valid(
      g_utf8_make_valid(key.text.data(), static_cast<gssize>(key.text.size())), g_free);
  pango_layout_set_text(layout.get(), valid.get(), -1);
  return layout;
}

}  // namespace brimol::pc
