#include "scene/item.h"

#include <cstring>
#include <tuple>

#include "scene/polygon.h"

namespace brimol::pc {

namespace {

bool sameNothing(const SKIA_Item&, const SKIA_Item&) { return true; }

bool sameName(const SKIA_Item& one, const SKIA_Item& other) {
  return shownText(one.text) == shownText(other.text);
}

bool sameText(const SKIA_Item& one, const SKIA_Item& other) {
  const auto look = [](const SKIA_Text& text) {
    return std::tie(text.color, text.align, text.size);
  };
  return look(one.text) == look(other.text) && sameName(one, other);
}

bool sameLine(const SKIA_Item& one, const SKIA_Item& other) {
  return std::memcmp(&one.point, &other.point, sizeof(SKIA_Point)) == 0;
}

bool sameArrow(const SKIA_Item& one, const SKIA_Item& other) {
  return one.point.color == other.point.color && (one.point.width == 0) == (other.point.width == 0);
}

Pixels rectBounds(const SKIA_Item& item, const Pixels& limits) {
  return within(edgesOf(item.rect), limits);
}

Pixels lineBounds(const SKIA_Item& item, const Pixels& limits) {
  return boundsOf(lineOutline(item.point), limits);
}

// What differs between the figures; a line alone has no rectangle.
struct FigureTraits {
  bool (*same)(const SKIA_Item& one, const SKIA_Item& other);
  Pixels (*bounds)(const SKIA_Item& item, const Pixels& limits);
};

// By Figure.
constexpr auto kFigures = std::to_array<FigureTraits>({
    {sameNothing, rectBounds},
    {sameText, rectBounds},
    {sameName, rectBounds},
    {sameLine, lineBounds},
    {sameArrow, rectBounds},
});

const FigureTraits& traitsOf(Figure figure) { return kFigures[static_cast<std::size_t>(figure)]; }

bool sameRect(const SKIA_Rect& one, const SKIA_Rect& other) {
  return std::tie(one.x, one.y, one.w, one.h) == std::tie(other.x, other.y, other.w, other.h);
}

}  // namespace

ItemKind kindOf(const SKIA_Item& item) {
  if (!isKnownKind(item.kind)) return {Ground::None, Figure::None, Unsized::Nothing};
  return kItemKinds[static_cast<std::size_t>(item.kind)];
}

Figure figureOf(const SKIA_Item& item) {
  const ItemKind kind = kindOf(item);
  if (kind.unsizedText == Unsized::Nothing || item.text.size != 0) return kind.figure;
  return shownText(item.text).empty() ? Figure::None : Figure::Picture;
}

std::string_view shownText(const SKIA_Text& text) {
  const auto room = static_cast<std::size_t>(std::clamp(text.string_len, 0, SKIA_TEXT_BYTES - 1));
  return {text.text, strnlen(text.text, room)};
}

bool drawTheSame(const SKIA_Item& one, const SKIA_Item& other) {
  const Figure figure = figureOf(one);
  if (one.kind != other.kind || figure != figureOf(other)) return false;
  if (figure != Figure::Line && !sameRect(one.rect, other.rect)) return false;
  if (kindOf(one).ground != Ground::None && one.rect.color != other.rect.color) return false;
  return traitsOf(figure).same(one, other);
}

Pixels boundsOf(const SKIA_Item& item, const Pixels& limits) {
  return traitsOf(figureOf(item)).bounds(item, limits);
}

}  // namespace brimol::pc
