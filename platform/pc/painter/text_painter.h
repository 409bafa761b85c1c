/// Texts in the project's fonts.
#pragma once

#include <brimol/scene.h>

#include <string>
#include <string_view>
#include <tuple>

#include "painter/canvas.h"
#include "painter/fonts.h"
#include "painter/ink.h"
#include "painter/laid_text.h"
#include "painter/lru_cache.h"
#include "scene/rectangles.h"

namespace brimol::pc {

/// Draws texts and keeps what was laid out for the recent ones. One thread uses it.
class TextPainter {
 public:
  TextPainter() : fonts(borrowFonts()), texts(kMostTextBytes) {}

  /// Draws the text in the middle of the rectangle's height, aligned as the record asks. Lines
  /// whose middle lies above or below the rectangle are left out. Only pixels in `clip` change: the
  /// item's bounds, or a part of them within the canvas. Bytes that are no UTF-8 draw the
  /// replacement character.
  void draw(const Canvas& canvas, const SKIA_Rect& rect, const SKIA_Text& text, const Pixels& clip);

  /// What draw() changes of the item's bounds at most.
  Pixels touched(const SKIA_Rect& rect, const SKIA_Text& text, const Pixels& bounds);

  /// Where the text's letters lie, though the rectangle's sides may cut them; empty for a text that
  /// draws nothing.
  TextInk inkOf(const SKIA_Rect& rect, const SKIA_Text& text);

  /// Of what is kept, bounded by kMostBytes and what the latest text took.
  std::size_t bytes() const { return texts.cost() + images.bytes(); }
  static constexpr std::size_t kMostBytes = std::size_t{5} << 20;

 private:
  // A key, and what stands for it in a look-up.
  struct KeyView {
    std::string_view text;
    int size;
  };
  struct Key {
    std::string text;
    int size;
    operator KeyView() const { return {text, size}; }
  };
  struct IsBefore {
    using is_transparent = void;
    bool operator()(const KeyView& one, const KeyView& other) const {
      return std::tie(one.size, one.text) < std::tie(other.size, other.text);
    }
  };

  static constexpr std::size_t kMostTextBytes = std::size_t{1} << 20;
  static constexpr std::size_t kMostImageBytes = kMostBytes - kMostTextBytes;

  const LaidText& laidText(const SKIA_Text& text);
  void trim();

  BorrowedFonts fonts;
  GlyphImages images;
  GlyphRun run{images};
  PlainShapes shapes;
  Ink ink{0};
  LruCache<Key, LaidText, IsBefore> texts;
};

}  // namespace brimol::pc
