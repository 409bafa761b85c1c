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

// Line by line, since each is aligned to the box and not to the longest of them. In a box with room
// for fewer lines, those whose middle lies outside are left out, and the others are whole.
void showLines(cairo_t* context, PangoLayout* layout, const Edges& box, int align) {
  int height = 0;
  pango_layout_get_size(layout, nullptr, &height);
  const int64_t top = centred(box.top, box.bottom, pixelsOf(height));
  const LayoutIterator iter(pango_layout_get_iter(layout));
  do {
    PangoRectangle extents;
    pango_layout_iter_get_line_extents(iter.get(), nullptr, &extents);
    const int64_t middle = top + pixelsOf(extents.y + extents.height / 2);
    if (middle < box.top || middle > box.bottom) continue;
    const int64_t x = aligned(box, align, pixelsOf(extents.width));
    const int64_t y = top + pixelsOf(pango_layout_iter_get_baseline(iter.get()));
    if (!isNear(x) || !isNear(y)) continue;
    cairo_move_to(context, static_cast<double>(x), static_cast<double>(y));
    pango_cairo_show_layout_line(context, pango_layout_iter_get_line_readonly(iter.get()));
  } while (pango_layout_iter_next_line(iter.get()) != FALSE);
}

}  // namespace

void TextPainter::draw(const Canvas& canvas, const SKIA_Rect& rect, const SKIA_Text& text,
                       const Pixels& clip) {
  if (textSizeOf(text) == 0 || alphaOf(text.color) == 0 || shownText(text).empty()) return;
  PangoLayout* const layout = layoutOf(text);
  cairo_t* const context = canvas.context();
  cairo_save(context);
  cairo_rectangle(context, clip.x, clip.y, clip.width, clip.height);
  cairo_clip(context);
  showLines(context, layout, edgesOf(rect), text.align);
  cairo_restore(context);
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
