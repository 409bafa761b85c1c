/// Texts in the project's fonts.
#pragma once

#include <brimol/scene.h>

#include <string>
#include <tuple>

#include "painter/canvas.h"
#include "painter/fonts.h"
#include "painter/lru_cache.h"
#include "scene/rectangles.h"

namespace brimol::pc {

/// What the letters of a text touch.
struct TextInk {
  Edges area = {0, 0, 0, 0};  // screen pixels
  bool isWhole = true;        // false: lines are left out for lack of height
};

/// Draws texts and keeps the layouts of the recent ones. One thread uses it.
class TextPainter {
 public:
  TextPainter() : fonts(borrowFonts()), layouts(kMostLayouts) {}

  /// Draws the text in the middle of the rectangle's height, aligned as the record asks. Lines
  /// whose middle lies above or below the rectangle are left out. Only pixels in `clip` change: the
  /// item's bounds, or a part of them within the canvas. Bytes that are no UTF-8 draw the
  /// replacement character.
  void draw(const Canvas& canvas, const SKIA_Rect& rect, const SKIA_Text& text, const Pixels& clip);

  /// Where the text's letters lie, though the rectangle's sides may cut them; empty for a text that
  /// draws nothing.
  TextInk inkOf(const SKIA_Rect& rect, const SKIA_Text& text);

  /// Bounded by kMostLayouts.
  std::size_t layoutCount() const { return layouts.size(); }
  static constexpr std::size_t kMostLayouts = 1024;

 private:
  struct Key {
    std::string text;
    int size;
    uint32_t color;
    friend bool operator<(const Key& one, const Key& other) {
      return std::tie(one.text, one.size, one.color) <
             std::tie(other.text, other.size, other.color);
    }
  };

  PangoLayout* layoutOf(const SKIA_Text& text);
  TextLayout makeLayout(const Key& key) const;

  BorrowedFonts fonts;
  LruCache<Key, TextLayout> layouts;
};

}  // namespace brimol::pc
