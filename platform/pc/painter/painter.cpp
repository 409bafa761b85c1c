#include "painter/painter.h"

#include <algorithm>

#include "painter/item_painter.h"

namespace brimol::pc {

namespace {

constexpr uint32_t kBlack = 0xFF000000;

// Whether nothing below the item shows in `piece`.
bool hides(const SKIA_Item& item, const Pixels& piece) {
  return groundOf(item) == Ground::Square && alphaOf(item.rect.color) == kOpaque &&
         covers(edgesOf(item.rect), piece);
}

}  // namespace

struct Painter::Parts {
  explicit Parts(Size screen) : canvas(screen), items(canvas) {}

  void paintPiece(const Frame& frame, const Pixels& piece) {
    const auto ground = std::find_if(frame.rbegin(), frame.rend(), [&piece](const SKIA_Item& item) {
      return hides(item, piece);
    });
    if (ground == frame.rend()) canvas.fill(piece, kBlack);
    const auto first = ground == frame.rend() ? frame.begin() : ground.base() - 1;
    std::for_each(first, frame.end(),
                  [this, &piece](const SKIA_Item& item) { items.draw(item, piece); });
  }

  Canvas canvas;
  ItemPainter items;
  Frame shown;
};

Painter::Painter(Size screen) : parts(std::make_unique<Parts>(screen)) {}

Painter::~Painter() = default;

Region Painter::paint(const Frame& next) {
  Region changed = changedRegion(parts->shown, next, parts->canvas.size());
  for (const Pixels& piece : changed) parts->paintPiece(next, piece);
  parts->shown = next;
  cairo_surface_mark_dirty(picture());
  return changed;
}

const Frame& Painter::frame() const { return parts->shown; }

cairo_surface_t* Painter::picture() const { return parts->canvas.surface(); }

}  // namespace brimol::pc
