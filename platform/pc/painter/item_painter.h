/// The drawing of every kind of display item.
#pragma once

#include "painter/canvas.h"
#include "painter/picture_cache.h"
#include "painter/text_painter.h"
#include "scene/item.h"

namespace brimol::pc {

/// Draws display items. One thread uses it.
class ItemPainter {
 public:
  /// `target` outlives the painter.
  explicit ItemPainter(const Canvas& target) : canvas(target) {}

  /// Draws of the item what lies in `clip`: within the canvas, not empty.
  void draw(const SKIA_Item& item, const Pixels& clip);

 private:
  void drawGround(const SKIA_Item& item, const Pixels& clip) const;
  void drawPicture(const SKIA_Item& item, const Pixels& clip);
  void drawLine(const SKIA_Item& item, const Pixels& clip) const;
  void drawArrow(const SKIA_Item& item, const Pixels& clip) const;

  const Canvas& canvas;
  TextPainter texts;
  PictureCache pictures;
};

}  // namespace brimol::pc
