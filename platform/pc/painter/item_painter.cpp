#include "painter/item_painter.h"

#include "painter/shapes.h"

namespace brimol::pc {

void ItemPainter::draw(const Frame& frame, std::size_t number, const Pixels& area, Covers& covers) {
  const SKIA_Item& item = frame[number];
  if (covers.hide(area, number + 1)) return;
  const Edges box = edgesOf(item.rect);
  if (groundOf(item) == Ground::Round) fillRoundBox({canvas, area, item.rect.color}, box);
  if (groundOf(item) == Ground::Square && !isEmpty(within(box, area))) {
    for (const Pixels& part : covers.partsInSight(within(box, area), number + 1)) {
      canvas.fill(part, item.rect.color);
    }
  }
  drawFigure(item, area);
}

void ItemPainter::drawFigure(const SKIA_Item& item, const Pixels& clip) {
  switch (figureOf(item)) {
    case Figure::None: return;
    case Figure::Text: return texts.draw(canvas, item.rect, item.text, clip);
    case Figure::Picture: return drawPicture(item, clip);
    case Figure::Line: return drawLine(item, clip);
    case Figure::Arrow: return drawArrow(item, clip);
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
