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

Pixels unionOf(const Pixels& one, const Pixels& other) {
  if (isEmpty(one) || isEmpty(other)) return isEmpty(one) ? other : one;
  const int left = std::min(one.x, other.x);
  const int top = std::min(one.y, other.y);
  return {left, top, std::max(one.x + one.width, other.x + other.width) - left,
          std::max(one.y + one.height, other.y + other.height) - top};
}

int64_t sizeOf(const Pixels& area) { return int64_t{area.width} * area.height; }

// Most frames are the one before, byte for byte; records have no gaps.
bool areEqual(const Frame& shown, const Frame& next) {
  return shown.size() == next.size() && !next.empty() &&
         std::memcmp(shown.data(), next.data(), next.size() * sizeof next[0]) == 0;
}

}  // namespace

const Region& Changes::between(const Frame& shown, const Frame& next) {
  pieces.clear();
  merged.clear();
  around = {};
  if (areEqual(shown, next)) return merged;
  collect(shown, next);
  if (!isEmpty(around)) merge();
  return merged;
}

void Changes::collect(const Frame& shown, const Frame& next) {
  const auto [shownFirst, nextFirst] =
      std::mismatch(shown.begin(), shown.end(), next.begin(), next.end(), drawTheSame);
  const auto [shownLast, nextLast] =
      std::mismatch(shown.rbegin(), std::make_reverse_iterator(shownFirst), next.rbegin(),
                    std::make_reverse_iterator(nextFirst), drawTheSame);
  const auto addItem = [this](const SKIA_Item& item) { add(boundsOf(item, wholeOf(screen))); };
  auto older = shownFirst;
  auto newer = nextFirst;
  for (; older != shownLast.base() && newer != nextLast.base(); ++older, ++newer) {
    if (drawTheSame(*older, *newer)) continue;
    if (differInTextAlone(*older, *newer)) {
      addTexts(*older, *newer);
    } else {
      addItem(*older);
      addItem(*newer);
    }
  }
  std::for_each(older, shownLast.base(), addItem);
  std::for_each(newer, nextLast.base(), addItem);
}

// Of a text that leaves most of its item free, the rest stays. Others are left whole, since the
// items of neighbours become one piece.
void Changes::addTexts(const SKIA_Item& older, const SKIA_Item& newer) {
  const Pixels before = boundsOf(older, wholeOf(screen));
  const Pixels after = boundsOf(newer, wholeOf(screen));
  const Pixels whole = unionOf(before, after);
  if (pieces.size() >= kMostPieces) return add(whole);
  const Pixels texts = unionOf(textArea(older, before), textArea(newer, after));
  add(2 * sizeOf(texts) <= sizeOf(whole) ? texts : whole);
}

void Changes::add(const Pixels& area) {
  if (isEmpty(area)) return;
  around = unionOf(around, area);
  if (pieces.size() <= kMostBounds) pieces.push_back(area);
}

// A merge without memory has no rectangles.
void Changes::merge() {
  merged.assign(1, around);
  const auto isAll = [this](const Pixels& piece) { return covers(edgesOf(piece), around); };
  if (pieces.size() > kMostBounds || std::ranges::any_of(pieces, isAll)) return;
  const CairoRegion region(
      cairo_region_create_rectangles(pieces.data(), static_cast<int>(pieces.size())));
  const int count = cairo_region_num_rectangles(region.get());
  if (count < 1 || count > kMostPieces) return;
  merged.resize(static_cast<std::size_t>(count));
  for (int i = 0; i < count; ++i) {
    cairo_region_get_rectangle(region.get(), i, &merged[static_cast<std::size_t>(i)]);
  }
}

}  // namespace brimol::pc
