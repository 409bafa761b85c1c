#include "scene/scene.h"

#include <algorithm>
#include <cstring>
#include <iterator>

#include "scene/cairo_handles.h"
#include "scene/item.h"

namespace brimol::pc {

namespace {

// More pieces than these are repainted as the one rectangle around them. The first bound keeps the
// merging of a large frame's bounds cheap, the second what a painter goes through.
constexpr std::size_t kMostBounds = 256;
constexpr int kMostPieces = 32;

// The bounds of changed items, and the rectangle around them all.
class Changes {
 public:
  explicit Changes(Size size) : screen(wholeOf(size)) {}

  void add(const SKIA_Item& item) {
    const Pixels area = boundsOf(item, screen);
    if (isEmpty(area)) return;
    around = isEmpty(around) ? area : unionOf(around, area);
    if (pieces.size() <= kMostBounds) pieces.push_back(area);
  }

  Region region() const {
    if (isEmpty(around)) return {};
    if (pieces.size() > kMostBounds) return {around};
    const CairoRegion merged(
        cairo_region_create_rectangles(pieces.data(), static_cast<int>(pieces.size())));
    const int count = cairo_region_num_rectangles(merged.get());
    // A merge without memory has no rectangles.
    if (count < 1 || count > kMostPieces) return {around};
    Region result(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i) {
      cairo_region_get_rectangle(merged.get(), i, &result[static_cast<std::size_t>(i)]);
    }
    return result;
  }

 private:
  static Pixels unionOf(const Pixels& one, const Pixels& other) {
    const int left = std::min(one.x, other.x);
    const int top = std::min(one.y, other.y);
    return {left, top, std::max(one.x + one.width, other.x + other.width) - left,
            std::max(one.y + one.height, other.y + other.height) - top};
  }

  Pixels screen;
  Pixels around = {};
  Region pieces;
};

}  // namespace

Region changedRegion(const Frame& shown, const Frame& next, Size screen) {
  // Most frames are the one before, byte for byte; records have no gaps.
  const bool isEqual = shown.size() == next.size() && !next.empty() &&
                       std::memcmp(shown.data(), next.data(), next.size() * sizeof next[0]) == 0;
  if (isEqual) return {};
  const auto [shownFirst, nextFirst] =
      std::mismatch(shown.begin(), shown.end(), next.begin(), next.end(), drawTheSame);
  const auto [shownLast, nextLast] =
      std::mismatch(shown.rbegin(), std::make_reverse_iterator(shownFirst), next.rbegin(),
                    std::make_reverse_iterator(nextFirst), drawTheSame);
  Changes changes(screen);
  auto older = shownFirst;
  auto newer = nextFirst;
  for (; older != shownLast.base() && newer != nextLast.base(); ++older, ++newer) {
    if (drawTheSame(*older, *newer)) continue;
    changes.add(*older);
    changes.add(*newer);
  }
  std::for_each(older, shownLast.base(), [&changes](const SKIA_Item& item) { changes.add(item); });
  std::for_each(newer, nextLast.base(), [&changes](const SKIA_Item& item) { changes.add(item); });
  return changes.region();
}

}  // namespace brimol::pc
