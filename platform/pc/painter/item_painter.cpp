#include "painter/item_painter.h"

#include "painter/shapes.h"

namespace brimol::pc {

const std::array<ItemPainter::DrawFigure, 5> ItemPainter::kFigures = {
    &ItemPainter::drawNothing, &ItemPainter::drawText,  &ItemPainter::drawPicture,
    &ItemPainter::drawLine,    &ItemPainter::drawArrow,
};

ItemPainter::ItemPainter(const Canvas& target) : canvas(target), texts(projectFontFiles()) {}

void ItemPainter::draw(const SKIA_Item& item, const Pixels& clip) {
  const Pixels area = within(boundsOf(item, wholeOf(canvas.size())), clip);
  if (isEmpty(area)) return;
  drawGround(item, area);
  (this->*kFigures[static_cast<std::size_t>(figureOf(item))])(item, area);
}

void ItemPainter::drawGround(const SKIA_Item& item, const Pixels& clip) const {
  switch (kindOf(item).ground) {
    case Ground::None: return;
    case Ground::Square: canvas.fill(clip, item.rect.color); return;
    case Ground::Round: fillRoundBox({canvas, clip, item.rect.color}, edgesOf(item.rect)); return;
  }
}

void ItemPainter::drawNothing(const SKIA_Item&, const Pixels&) {}

void ItemPainter::drawText(const SKIA_Item& item, const Pixels& clip) {
  texts.draw(canvas, item.rect, item.text, clip);
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

void ItemPainter::drawLine(const SKIA_Item& item, const Pixels& clip) {
  if (isAxisAligned(item.point)) return canvas.fill(clip, item.point.color);
  fillPolygon({canvas, clip, item.point.color}, lineOutline(item.point), wholeOf(canvas.size()));
}

void ItemPainter::drawArrow(const SKIA_Item& item, const Pixels& clip) {
  const Edges box = edgesOf(item.rect);
  fillPolygon({canvas, clip, item.point.color},
              item.point.width == 0 ? rightArrowOutline(box) : leftArrowOutline(box),
              within(box, wholeOf(canvas.size())));
}

}  // namespace brimol::pc
