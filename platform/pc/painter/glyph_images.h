/// The coverage of single glyphs, kept to compose lines of them.
#pragma once

#include <pango/pango.h>

#include <cstdint>
#include <map>
#include <memory>
#include <span>
#include <vector>

#include "painter/ink.h"
#include "scene/rectangles.h"

namespace brimol::pc {

/// A glyph's covered pixels around its origin. A blank has no area.
class GlyphImage {
 public:
  GlyphImage() = default;
  /// `coverage`: the pixels of `bounds` row by row, 0 to 255 each.
  GlyphImage(std::span<const uint8_t> coverage, const Pixels& bounds);

  /// The smallest area that has all covered pixels.
  const Pixels& area() const { return box; }
  /// Of a row of the area, from 0 on; places are counted from the area's left edge.
  std::span<const CoveredGroup> row(std::size_t number) const {
    return {groups.data() + rows[number], groups.data() + rows[number + 1]};
  }
  std::size_t groupCount() const { return groups.size(); }
  std::size_t bytes() const {
    return sizeof *this + groups.size() * sizeof groups[0] + rows.size() * sizeof rows[0];
  }

 private:
  Pixels box = {};
  std::vector<CoveredGroup> groups;  // row by row, from left to right, none over another
  std::vector<uint32_t> rows;        // where each row's groups begin, and where the last row's end
};

/// Renders glyphs once. One thread uses it.
class GlyphImages {
 public:
  /// Forgets all of them where they have become too many. References end here.
  void trim();

  /// Valid until the next trim().
  const GlyphImage& of(PangoFont* font, PangoGlyph glyph);

  /// Bytes of what is kept, after trim() bounded by kMostBytes.
  std::size_t bytes() const { return total; }
  static constexpr std::size_t kMostBytes = std::size_t{1} << 20;

 private:
  struct FontDeleter {
    void operator()(PangoFont* font) const { g_object_unref(font); }
  };
  // The glyphs of a font, which lives as long as they are kept: no other one has its address.
  struct Sheet {
    std::unique_ptr<PangoFont, FontDeleter> font;
    std::vector<std::unique_ptr<GlyphImage>> images;  // by glyph
  };

  Sheet& sheetOf(PangoFont* font);

  std::map<PangoFont*, Sheet> sheets;
  Sheet* latest = nullptr;
  std::size_t total = 0;
};

/// A glyph, and where its origin lies from the line's left end and baseline, in pixels.
using PlacedGlyph = cairo_glyph_t;

/// What glyphs that cairo draws at once cover together: the pixels of `area` row by row.
std::vector<uint8_t> coverageOf(PangoFont* font, std::span<const PlacedGlyph> glyphs,
                                const Pixels& area);

}  // namespace brimol::pc
