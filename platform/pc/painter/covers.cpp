#include "painter/covers.h"

#include "painter/shapes.h"
#include "scene/item.h"

namespace brimol::pc {

namespace {

// More boxes, or smaller ones, cost more than they save.
constexpr std::size_t kMostCovers = 96;
constexpr int kLeastPixels = 2048;

// The pixels that the item overwrites for sure.
Edges overwritten(const SKIA_Item& item) {
  if (alphaOf(item.rect.color) != kOpaque) return {};
  switch (groundOf(item)) {
    case Ground::None: return {};
    case Ground::Square: return edgesOf(item.rect);
    case Ground::Round: return fullRowsOf(edgesOf(item.rect));
  }
  return {};
}

// Whether the rows of the area through the hole are worth writing as a whole: those that the
// processor's cache still has when the box is drawn over them.
bool hasNarrowEnds(const Pixels& area, const Pixels& hole) {
  constexpr int kRowsPerEnds = 8;
  constexpr int64_t kMostPixels = int64_t{1} << 18;
  const int ends = area.width - hole.width;
  return ends > 0 && ends <= area.width / kRowsPerEnds &&
         int64_t{area.width} * hole.height <= kMostPixels;
}

}  // namespace

void Covers::collect(const Frame& frame, const Pixels& piece) {
  covers.clear();
  for (std::size_t i = frame.size(); i > 0 && covers.size() < kMostCovers; --i) {
    const Pixels area = within(overwritten(frame[i - 1]), piece);
    if (int64_t{area.width} * area.height >= kLeastPixels) covers.push_back({i - 1, area});
  }
}

bool Covers::hide(const Pixels& area, std::size_t first) const {
  for (const Cover& cover : covers) {
    if (cover.item < first) return false;
    if (pc::covers(edgesOf(cover.area), area)) return true;
  }
  return false;
}

const Region& Covers::partsInSight(const Pixels& area, std::size_t first) {
  split(area, first, Ends::Alone);
  return parts;
}

Covers::Sight Covers::sightOf(const Pixels& area, std::size_t first) {
  split(area, first, Ends::WithRow);
  return {parts, rows};
}

void Covers::split(const Pixels& area, std::size_t first, Ends ends) {
  parts.clear();
  rows.clear();
  rests.assign(1, {area, 0});
  while (!rests.empty()) {
    auto [rest, next] = rests.back();
    rests.pop_back();
    Pixels hidden = {};
    while (isEmpty(hidden) && next < covers.size() && covers[next].item >= first) {
      hidden = within(covers[next++].area, rest);
    }
    if (isEmpty(hidden)) {
      parts.push_back(rest);
    } else {
      pushAround(rest, hidden, next, ends);
    }
  }
}

void Covers::pushAround(const Pixels& area, const Pixels& hole, std::size_t cover, Ends ends) {
  const auto push = [&](const Edges& edges) {
    const Pixels rest = within(edges, area);
    if (!isEmpty(rest)) rests.push_back({rest, cover});
  };
  const Edges outer = edgesOf(area);
  const Edges inner = edgesOf(hole);
  push({outer.left, outer.top, outer.right, inner.top});
  if (ends == Ends::WithRow && hasNarrowEnds(area, hole)) {
    rows.push_back({area.x, hole.y, area.width, hole.height});
  } else {
    push({outer.left, inner.top, inner.left, inner.bottom});
    push({inner.right, inner.top, outer.right, inner.bottom});
  }
  push({outer.left, inner.bottom, outer.right, outer.bottom});
}

}  // namespace brimol::pc
