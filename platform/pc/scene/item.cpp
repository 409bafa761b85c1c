#include "scene/item.h"

#include <algorithm>
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
  return one.point.color == other.point.color &&
         (one.point.width == SKIA_ARROW_RIGHT) == (other.point.width == SKIA_ARROW_RIGHT);
}

// Most that a line's ascent and descent add up to, in per cent of the text's size: those of the
// Arabic font, the highest.
constexpr int64_t kLinePercent = 212;

int64_t linesOf(std::string_view text) {
  return 1 + std::ranges::count(text, '\n') + std::ranges::count(text, '\r');
}

// How far the drawn lines reach above and below a rectangle of that height at most. The text stands
// in the middle, and lines whose own middle lies outside are not drawn.
int64_t reachOf(const SKIA_Text& text, int64_t height) {
  constexpr int64_t kWhole = 100;
  const std::string_view words = shownText(text);
  if (words.empty()) return 0;
  const int64_t line = (textSizeOf(text) * kLinePercent + kWhole - 1) / kWhole;
  return std::clamp<int64_t>((line * linesOf(words) - height + 1) / 2, 0, (line + 1) / 2);
}

Pixels rectBounds(const SKIA_Item& item, const Pixels& limits) {
  return within(edgesOf(item.rect), limits);
}

Pixels textBounds(const SKIA_Item& item, const Pixels& limits) {
  Edges box = edgesOf(item.rect);
  if (isEmpty(box)) return {};
  const int64_t reach = reachOf(item.text, item.rect.h);
  box.top -= reach;
  box.bottom += reach;
  return within(box, limits);
}

Pixels lineBounds(const SKIA_Item& item, const Pixels& limits) {
  return boundsOf(lineOutline(item.point), limits);
}

// What differs between the figures; a line alone has no rectangle.
struct FigureTraits {
  Figure figure;
  bool (*same)(const SKIA_Item& one, const SKIA_Item& other);
  Pixels (*bounds)(const SKIA_Item& item, const Pixels& limits);
};

constexpr auto kFigures = std::to_array<FigureTraits>({
    {Figure::None, sameNothing, rectBounds},
    {Figure::Text, sameText, textBounds},
    {Figure::Picture, sameName, rectBounds},
    {Figure::Line, sameLine, lineBounds},
    {Figure::Arrow, sameArrow, rectBounds},
});
static_assert(isInOrder(kFigures, &FigureTraits::figure));

const FigureTraits& traitsOf(Figure figure) { return kFigures[static_cast<std::size_t>(figure)]; }

bool sameRect(const SKIA_Rect& one, const SKIA_Rect& other) {
  return std::tie(one.x, one.y, one.w, one.h) == std::tie(other.x, other.y, other.w, other.h);
}

// At most in the words of a figure that both have.
bool differInFigureAlone(const SKIA_Item& one, const SKIA_Item& other) {
  const Figure figure = figureOf(one);
  if (one.kind != other.kind || figure != figureOf(other)) return false;
  if (figure != Figure::Line && !sameRect(one.rect, other.rect)) return false;
  return groundOf(one) == Ground::None || one.rect.color == other.rect.color;
}

}  // namespace

Ground groundOf(const SKIA_Item& item) {
  return isKnownKind(item.kind) ? kItemKinds[static_cast<std::size_t>(item.kind)].ground
                                : Ground::None;
}

Figure figureOf(const SKIA_Item& item) {
  if (!isKnownKind(item.kind)) return Figure::None;
  const ItemKind& kind = kItemKinds[static_cast<std::size_t>(item.kind)];
  if (kind.unsizedText == Unsized::Nothing || item.text.size != 0) return kind.figure;
  return shownText(item.text).empty() ? Figure::None : Figure::Picture;
}

std::string_view shownText(const SKIA_Text& text) {
  const auto room = static_cast<std::size_t>(std::clamp(text.string_len, 0, SKIA_TEXT_BYTES - 1));
  return {text.text, strnlen(text.text, room)};
}

int textSizeOf(const SKIA_Text& text) { return std::clamp(text.size, 0, kMostTextSize); }

bool drawTheSame(const SKIA_Item& one, const SKIA_Item& other) {
  return differInFigureAlone(one, other) && traitsOf(figureOf(one)).same(one, other);
}

bool differInTextAlone(const SKIA_Item& one, const SKIA_Item& other) {
  return figureOf(one) == Figure::Text && differInFigureAlone(one, other);
}

Pixels boundsOf(const SKIA_Item& item, const Pixels& limits) {
  return traitsOf(figureOf(item)).bounds(item, limits);
}

}  // namespace brimol::pc
