#include "painter/plain_shapes.h"

#include <algorithm>
#include <span>

namespace brimol::pc {

namespace {

bool isPlain(char letter) { return letter >= ' ' && letter <= '~'; }

bool isLetter(char letter) {
  return (letter >= 'a' && letter <= 'z') || (letter >= 'A' && letter <= 'Z');
}

std::span<const PangoGlyphInfo> glyphsOf(const PangoGlyphString& shaped) {
  return {shaped.glyphs, static_cast<std::size_t>(shaped.num_glyphs)};
}

// The one run of a text of one line; null where there is another number of runs.
const PangoGlyphItem* onlyRun(PangoLayout* layout) {
  if (pango_layout_get_line_count(layout) != 1) return nullptr;
  const GSList* const runs = pango_layout_get_line_readonly(layout, 0)->runs;
  if (runs == nullptr || runs->next != nullptr) return nullptr;
  return static_cast<const PangoGlyphItem*>(runs->data);
}

// Whether each character has one glyph, which stands where the advances put it.
bool isSimple(std::string_view words, const PangoGlyphItem& run) {
  if (run.y_offset != 0 || run.start_x_offset != 0 || run.end_x_offset != 0) return false;
  const auto all = glyphsOf(*run.glyphs);
  return all.size() == words.size() && std::ranges::all_of(all, [](const PangoGlyphInfo& info) {
           return info.glyph < PANGO_GLYPH_UNKNOWN_FLAG && info.geometry.x_offset == 0 &&
                  info.geometry.y_offset == 0;
         });
}

char letterAt(std::string_view words, std::size_t place) {
  return place < words.size() ? words[place] : '\0';
}

}  // namespace

PlainShapes::Sheet::Sheet(PangoFont* font, const LineMetrics& metrics)
    : face(PANGO_FONT(g_object_ref(font))), lines(metrics) {
  for (auto& row : advances) row.fill(kUnknown);
}

bool PlainShapes::Sheet::knows(std::string_view words) const {
  for (std::size_t i = 0; i < words.size(); ++i) {
    if (advance(words[i], letterAt(words, i + 1)) == kUnknown) return false;
  }
  return true;
}

void PlainShapes::Sheet::learn(std::string_view words, const PangoGlyphString& shaped) {
  const auto all = glyphsOf(shaped);
  for (std::size_t i = 0; i < words.size(); ++i) {
    const char next = letterAt(words, i + 1);
    glyphs.at(indexOf(words[i])) = all[i].glyph;
    advances.at(indexOf(words[i])).at(next == 0 ? kLetters : indexOf(next)) = all[i].geometry.width;
  }
}

PlainShapes::Key PlainShapes::keyOf(std::string_view words, int size) {
  return {size, std::ranges::any_of(words, isLetter)};
}

const PlainShapes::Sheet* PlainShapes::sheetFor(std::string_view words, int size) {
  if (words.empty() || !std::ranges::all_of(words, isPlain)) return nullptr;
  const auto* const sheet = sheets.find(keyOf(words, size));
  return sheet != nullptr && (*sheet)->knows(words) ? sheet->get() : nullptr;
}

void PlainShapes::learn(std::string_view words, int size, PangoLayout* layout,
                        const LineMetrics& metrics) {
  if (words.empty() || !std::ranges::all_of(words, isPlain)) return;
  const PangoGlyphItem* const run = onlyRun(layout);
  if (run == nullptr || !isSimple(words, *run)) return;
  PangoFont* const font = run->item->analysis.font;
  const Key key = keyOf(words, size);
  auto* sheet = sheets.find(key);
  if (sheet == nullptr) {
    sheet = &sheets.put(key, std::unique_ptr<Sheet>(new Sheet(font, metrics)), 1);
  }
  if ((*sheet)->font() != font || (*sheet)->metrics() != metrics) return;
  (*sheet)->learn(words, *run->glyphs);
}

}  // namespace brimol::pc
