#include "painter/item_painter.h"

#include "painter/shapes.h"

namespace brimol::pc {

void ItemPainter::draw(const SKIA_Item& item, const Pixels& clip) {
  const Pixels area = within(boundsOf(item, wholeOf(canvas.size())), clip);
  if (isEmpty(area)) return;
  drawGround(item, area);
  switch (figureOf(item)) {
    case Figure::None: return;
    case Figure::Text: return texts.draw(canvas, item.rect, item.text, area);
    case Figure::Picture: return drawPicture(item, area);
    case Figure::Line: return drawLine(item, area);
    case Figure::Arrow: return drawArrow(item, area);
  }
}

void ItemPainter::drawGround(const SKIA_Item& item, const Pixels& clip) const {
  const Brush brush = {canvas, clip, item.rect.color};
  const Edges box = edgesOf(item.rect);
  switch (groundOf(item)) {
    case Ground::None: return;
    case Ground::Square: return brush.fill(box);
    case Ground::Round: return fillRoundBox(brush, box);
  }
}

void ItemPainter::drawPicture(const SKIA_Item& item, const Pixels& clip) {
  const SKIA_Rect& rect = item.rect;
  cairo_surface_t* const picture = pictures.scaled(shownText(item.text), {rect.w, rect.h});
  if (picture == nullptr) return drawMissingPicture(canvas, edgesOf(rect), clip);
  cairo_t* const context = canvas.context();
  cairo_set_source_surface(context, picture, rect.x, rect.y);
  cairo_rectangle(context, clip.x, clip.y, clip.width, clip.height);
  cairo_fill(context);
}

void ItemPainter::drawLine(const SKIA_Item& item, const Pixels& clip) const {
  if (isAxisAligned(item.point)) return canvas.fill(clip, item.point.color);
  fillPolygon({canvas, clip, item.point.color}, lineOutline(item.point), wholeOf(canvas.size()));
}

void ItemPainter::drawArrow(const SKIA_Item& item, const Pixels& clip) const {
  const Edges box = edgesOf(item.rect);
  fillPolygon({canvas, clip, item.point.color},
              item.point.width == 0 ? rightArrowOutline(box) : leftArrowOutline(box),
              within(box, wholeOf(canvas.size())));
}

}  // namespace brimol::pc
