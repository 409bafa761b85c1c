/// How plain texts are shaped, learnt from those that Pango has shaped.
#pragma once

#include <pango/pango.h>

#include <array>
#include <cstdint>
#include <memory>
#include <string_view>
#include <tuple>

#include "painter/lru_cache.h"

namespace brimol::pc {

/// Of the lines of one font in one size, in pixels from the line's top.
struct LineMetrics {
  int height;
  int middle;
  int baseline;
  friend bool operator==(const LineMetrics&, const LineMetrics&) = default;
};

/// The glyphs of printable ASCII in one size, and how far each moves on before each other one. In
/// the font that draws them a character always has the same glyph, and its advance depends on the
/// character after it alone; only its ligatures are otherwise, which are never learnt. So a text of
/// which every pair has been met is shaped without Pango as Pango would do it.
class PlainShapes {
 public:
  /// The shapes of a size.
  class Sheet {
   public:
    PangoFont* font() const { return face.get(); }
    const LineMetrics& metrics() const { return lines; }
    PangoGlyph glyph(char letter) const { return glyphs.at(indexOf(letter)); }
    /// In Pango units; `next` is 0 at the text's end.
    int advance(char letter, char next) const {
      return advances.at(indexOf(letter)).at(next == 0 ? kLetters : indexOf(next));
    }

   private:
    friend class PlainShapes;
    struct FontDeleter {
      void operator()(PangoFont* font) const { g_object_unref(font); }
    };
    static constexpr std::size_t kLetters = 95;
    static constexpr int kUnknown = -1;

    Sheet(PangoFont* font, const LineMetrics& metrics);
    static std::size_t indexOf(char letter) { return static_cast<std::size_t>(letter - ' '); }
    bool knows(std::string_view words) const;
    void learn(std::string_view words, const PangoGlyphString& shaped);

    std::unique_ptr<PangoFont, FontDeleter> face;
    LineMetrics lines;
    std::array<PangoGlyph, kLetters> glyphs = {};
    std::array<std::array<int, kLetters + 1>, kLetters> advances;
  };

  PlainShapes() : sheets(kMostSheets) {}

  /// The sheet by which the text is shaped, until the next call of learn(). Null where Pango must
  /// shape it.
  const Sheet* sheetFor(std::string_view words, int size);

  /// Takes over what Pango made of a text of that size.
  void learn(std::string_view words, int size, PangoLayout* layout, const LineMetrics& metrics);

 private:
  // A text without letters is of no script, for which a font may have other rules.
  struct Key {
    int size;
    bool hasLetters;
    friend bool operator<(const Key& one, const Key& other) {
      return std::tie(one.size, one.hasLetters) < std::tie(other.size, other.hasLetters);
    }
  };
  static constexpr std::size_t kMostSheets = 8;

  static Key keyOf(std::string_view words, int size);

  LruCache<Key, std::unique_ptr<Sheet>> sheets;
};

}  // namespace brimol::pc
