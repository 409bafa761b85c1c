/// The images of glyphs, kept to compose lines of them.
#pragma once

#include <pango/pango.h>

#include <map>
#include <memory>
#include <optional>
#include <span>
#include <tuple>
#include <unordered_map>
#include <vector>

#include "painter/glyph_image.h"

namespace brimol::pc {

/// Renders glyphs once. One thread uses it.
class GlyphImages {
 public:
  /// Valid until clear().
  GlyphImage& of(PangoFont* font, PangoGlyph glyph);

  /// What two images show at once; none where only cairo can tell.
  using Sum = std::optional<GlyphImage>;

  /// Two images, and how far the second stands to the right and below: in pixels, and in the steps
  /// by which cairo tells whether outlines come near each other.
  struct Pair {
    const GlyphImage* one;
    const GlyphImage* other;
    PixelPlace pixels;
    PixelPlace steps;
    friend bool operator<(const Pair& left, const Pair& right) {
      const auto words = [](const Pair& pair) {
        const auto& [first, second, away, stepsAway] = pair;
        return std::tuple(first, second, away.x, away.y, stepsAway.x, stepsAway.y);
      };
      return words(left) < words(right);
    }
  };

  /// Null where none is kept.
  Sum* sumOf(const Pair& pair);

  /// Keeps the sum of a pair of which none is kept.
  Sum& keepSum(const Pair& pair, Sum sum);

  /// Forgets all of them. References end here.
  void clear();

  std::size_t bytes() const { return total; }

 private:
  struct FontDeleter {
    void operator()(PangoFont* font) const { g_object_unref(font); }
  };
  // The glyphs of a font, which lives as long as they are kept: no other one has its address.
  struct Sheet {
    std::unique_ptr<PangoFont, FontDeleter> font;
    std::unordered_map<PangoGlyph, GlyphImage> images;
  };

  Sheet& sheetOf(PangoFont* font);

  std::map<PangoFont*, Sheet> sheets;
  Sheet* latest = nullptr;
  std::map<Pair, Sum> sums;
  std::size_t total = 0;
};

/// A glyph, and where its origin lies from the line's left end and baseline, in pixels.
using PlacedGlyph = cairo_glyph_t;

/// What glyphs that cairo draws at once cover together: the pixels of `area` row by row.
std::vector<uint8_t> coverageOf(PangoFont* font, std::span<const PlacedGlyph> glyphs,
                                const Pixels& area);

}  // namespace brimol::pc
