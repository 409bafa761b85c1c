#include "painter/painter.h"

#include <algorithm>
#include <vector>

#include "painter/item_painter.h"

namespace brimol::pc {

namespace {

constexpr uint32_t kBlack = 0xFF000000;

// A box without a figure that lies over the whole of `piece`.
bool isFlatOver(const SKIA_Item& item, const Pixels& piece) {
  return groundOf(item) == Ground::Square && figureOf(item) == Figure::None &&
         covers(edgesOf(item.rect), piece);
}

bool isOpaqueFlat(const SKIA_Item& item, const Pixels& piece) {
  return alphaOf(item.rect.color) == kOpaque && isFlatOver(item, piece);
}

// What lies at the bottom of a piece: one colour, and the number of the first item above it.
struct Backdrop {
  uint32_t color;
  std::size_t next;
};

// Boxes that each lie over the whole piece are one colour, which one pixel tells.
Backdrop backdropOf(const Frame& frame, const std::vector<Pixels>& bounds, const Pixels& piece) {
  const auto isOpaque = [&piece](const SKIA_Item& item) { return isOpaqueFlat(item, piece); };
  const auto last = std::find_if(frame.rbegin(), frame.rend(), isOpaque);
  Backdrop backdrop = {kBlack, static_cast<std::size_t>(last.base() - frame.begin())};
  if (backdrop.next > 0) backdrop.color = last->rect.color;
  for (; backdrop.next < frame.size(); ++backdrop.next) {
    const SKIA_Item& item = frame[backdrop.next];
    if (isEmpty(within(bounds[backdrop.next], piece))) continue;
    if (!isFlatOver(item, piece)) break;
    if (alphaOf(item.rect.color) != 0) backdrop.color = laidOver(backdrop.color, item.rect.color);
  }
  return backdrop;
}

}  // namespace

struct Painter::Parts {
  explicit Parts(Size screen)
      : canvas(screen),
        items(canvas),
        changes(canvas.size(), [this](const SKIA_Item& item, const Pixels& area) {
          return items.textArea(item, area);
        }) {}

  void paint(const Frame& frame, const Region& pieces) {
    bounds.clear();
    for (const SKIA_Item& item : frame) bounds.push_back(boundsOf(item, wholeOf(canvas.size())));
    for (const Pixels& piece : pieces) paintPiece(frame, piece);
  }

  void paintPiece(const Frame& frame, const Pixels& piece) {
    covers.collect(frame, piece);
    const auto [color, next] = backdropOf(frame, bounds, piece);
    const Covers::Sight sight = covers.sightOf(piece, next);
    for (const Pixels& part : sight.parts) canvas.fill(part, color);
    late = sight.rows;
    for (std::size_t i = next; i < frame.size(); ++i) {
      const Pixels area = within(bounds[i], piece);
      if (isEmpty(area)) continue;
      fillBelow(area, color);
      items.draw(frame, i, area, covers);
    }
  }

  // Fills the rows that the area touches, unless they were filled before.
  void fillBelow(const Pixels& area, uint32_t color) {
    std::erase_if(late, [&](const Pixels& row) {
      if (isEmpty(within(area, row))) return false;
      canvas.fill(row, color);
      return true;
    });
  }

  Canvas canvas;
  ItemPainter items;
  Covers covers;
  Region late;  // rows of the backdrop that are filled when something is first drawn over them
  Changes changes;
  std::vector<Pixels> bounds;  // of the frame's items
  Frame shown;
};

Painter::Painter(Size screen) : parts(std::make_unique<Parts>(screen)) {}

Painter::~Painter() = default;

const Region& Painter::paint(const Frame& next) {
  const Region& changed = parts->changes.between(parts->shown, next);
  if (!changed.empty()) parts->paint(next, changed);
  parts->shown = next;
  cairo_surface_mark_dirty(picture());
  return changed;
}

const Frame& Painter::frame() const { return parts->shown; }

cairo_surface_t* Painter::picture() const { return parts->canvas.surface(); }

}  // namespace brimol::pc
