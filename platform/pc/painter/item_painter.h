/// The drawing of every kind of display item.
#pragma once

#include "painter/canvas.h"
#include "painter/covers.h"
#include "painter/picture_cache.h"
#include "painter/text_painter.h"
#include "scene/item.h"

namespace brimol::pc {

/// Draws display items. One thread uses it.
class ItemPainter {
 public:
  /// `target` outlives the painter.
  explicit ItemPainter(const Canvas& target) : canvas(target) {}

  /// Draws of the item of that number what lies in `area`: the item's bounds, or a part of them
  /// within the canvas. What `covers` hide may be left out.
  void draw(const Frame& frame, std::size_t number, const Pixels& area, Covers& covers);

  /// What the item's text touches of the item's bounds.
  Pixels textArea(const SKIA_Item& item, const Pixels& bounds) {
    return texts.touched(item.rect, item.text, bounds);
  }

 private:
  void drawFigure(const SKIA_Item& item, const Pixels& clip);
  void drawPicture(const SKIA_Item& item, const Pixels& clip);
  void drawLine(const SKIA_Item& item, const Pixels& clip) const;
  void drawArrow(const SKIA_Item& item, const Pixels& clip) const;

  const Canvas& canvas;
  TextPainter texts;
  PictureCache pictures;
};

}  // namespace brimol::pc
