#include "display/info_table.h"

#include <pango/pangocairo.h>

#include <algorithm>
#include <numbers>
#include <string>

namespace brimol::pc {

namespace {

constexpr int kLeastLetter = 6;  // pixels
constexpr double kPanelAlpha = 0.93;
constexpr int kNatural = -1;  // Pango's width of a text that is not wrapped

TextLayout layoutOf(Fonts& fonts, std::string_view text, int letter, int width) {
  TextLayout layout(pango_layout_new(fonts.contextFor(text)));
  const FontDescription font = projectFonts(letter);
  pango_layout_set_font_description(layout.get(), font.get());
  pango_layout_set_text(layout.get(), text.data(), static_cast<int>(text.size()));
  pango_layout_set_wrap(layout.get(), PANGO_WRAP_WORD_CHAR);
  pango_layout_set_width(layout.get(), width == kNatural ? kNatural : width * PANGO_SCALE);
  return layout;
}

Size sizeOf(const TextLayout& layout) {
  Size size = {};
  pango_layout_get_pixel_size(layout.get(), &size.w, &size.h);
  return size;
}

void roundPath(cairo_t* context, double left, double top, Size size, double radius) {
  constexpr double kQuarter = std::numbers::pi / 2;
  const double right = left + size.w;
  const double bottom = top + size.h;
  cairo_new_path(context);
  cairo_arc(context, right - radius, top + radius, radius, -kQuarter, 0);
  cairo_arc(context, right - radius, bottom - radius, radius, 0, kQuarter);
  cairo_arc(context, left + radius, bottom - radius, radius, kQuarter, 2 * kQuarter);
  cairo_arc(context, left + radius, top + radius, radius, 2 * kQuarter, 3 * kQuarter);
  cairo_close_path(context);
}

void show(cairo_t* context, const TextLayout& layout, int left, int top) {
  cairo_move_to(context, left, top);
  pango_cairo_show_layout(context, layout.get());
}

}  // namespace

InfoTable::InfoTable(Fonts& fonts, const std::vector<HelpRow>& rows, int wantedLetter, Size room)
    : letter(std::max(wantedLetter, kLeastLetter)) {
  layOut(fonts, rows, room.w);
  while (letter > kLeastLetter && (extent.h > room.h || extent.w > room.w)) {
    --letter;
    layOut(fonts, rows, room.w);
  }
}

// Around the words and between the columns is a letter's height, between the rows a third of it.
void InfoTable::layOut(Fonts& fonts, const std::vector<HelpRow>& rows, int width) {
  constexpr int kMargins = 3;
  constexpr int kGapPart = 3;
  lines.clear();
  labelWidth = 0;
  for (const HelpRow& row : rows) {
    TextLayout label = layoutOf(fonts, row.label, letter, kNatural);
    labelWidth = std::max(labelWidth, sizeOf(label).w);
    lines.push_back({std::move(label), nullptr, 0});
  }
  const int most = std::max(width - labelWidth - kMargins * letter, 1);
  int widest = 0;
  extent.h = 2 * letter - letter / kGapPart;
  for (std::size_t i = 0; i < rows.size(); ++i) {
    Row& line = lines[i];
    line.meaning = layoutOf(fonts, rows[i].meaning, letter, most);
    const Size size = sizeOf(line.meaning);
    widest = std::max(widest, size.w);
    const bool isGap = rows[i].label.empty();
    line.height = isGap ? letter / 2 : std::max(size.h, sizeOf(line.label).h) + letter / kGapPart;
    extent.h += line.height;
  }
  extent.w = labelWidth + widest + kMargins * letter;
}

void InfoTable::draw(cairo_t* context, int left, int top) const {
  constexpr double kRadius = 0.6;  // of a letter
  roundPath(context, left, top, extent, kRadius * letter);
  cairo_set_source_rgba(context, 0.07, 0.09, 0.13, kPanelAlpha);
  cairo_fill(context);
  int y = top + letter;
  for (const Row& line : lines) {
    cairo_set_source_rgb(context, 0.55, 0.80, 1.0);
    show(context, line.label, left + letter, y);
    cairo_set_source_rgb(context, 1, 1, 1);
    show(context, line.meaning, left + 2 * letter + labelWidth, y);
    y += line.height;
  }
}

}  // namespace brimol::pc
