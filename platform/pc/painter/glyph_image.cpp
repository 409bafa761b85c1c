#include "painter/glyph_image.h"

#include <algorithm>

namespace brimol::pc {

namespace {

constexpr int kGroup = CoveredGroup::kPixels;

// The smallest area around the pixels of `bounds` that are not 0.
Pixels inked(std::span<const uint8_t> coverage, const Pixels& bounds) {
  Edges edges = {bounds.width, bounds.height, 0, 0};
  for (int y = 0, i = 0; y < bounds.height; ++y) {
    for (int x = 0; x < bounds.width; ++x, ++i) {
      if (coverage[static_cast<std::size_t>(i)] == 0) continue;
      edges = {std::min<int64_t>(edges.left, x), std::min<int64_t>(edges.top, y),
               std::max<int64_t>(edges.right, x + 1), y + 1};
    }
  }
  Pixels area = within(edges, {0, 0, bounds.width, bounds.height});
  area.x += bounds.x;
  area.y += bounds.y;
  return area;
}

// A row of the canvas, and where in it the image begins and the clip lies.
struct Row {
  uint32_t* pixels;
  int left;
  int clipLeft;
  int clipRight;
};

// Draws a group of which a part lies outside the clip, on a copy of the part inside.
void drawCut(const Row& row, const CoveredGroup& group, Ink& ink) {
  const int start = row.left + group.x;
  const int first = std::max(start, row.clipLeft);
  const int last = std::min(start + kGroup, row.clipRight);
  if (first >= last) return;
  std::array<uint32_t, kGroup> pixels = {};
  pixels.fill(row.pixels[first]);
  CoveredGroup part = {0, {}};
  for (int x = first; x < last; ++x) {
    const auto place = static_cast<std::size_t>(x - start);
    pixels.at(place) = row.pixels[x];
    part.coverage.at(place) = group.coverage.at(place);
  }
  ink.lay(pixels.data(), 0, {&part, 1});
  std::copy_n(pixels.begin() + (first - start), last - first, row.pixels + first);
}

// Draws a row of groups of which some may be cut.
void drawRow(const Row& row, std::span<const CoveredGroup> groups, Ink& ink) {
  for (const CoveredGroup& group : groups) {
    const int start = row.left + group.x;
    if (start >= row.clipLeft && start + kGroup <= row.clipRight) {
      ink.lay(row.pixels, row.left, {&group, 1});
    } else {
      drawCut(row, group, ink);
    }
  }
}

// Whether two groups share a covered pixel; the other one begins `by` pixels to the right.
bool overlap(const CoveredGroup& one, const CoveredGroup& other, int by) {
  for (int i = std::max(by, 0); i < std::min(kGroup, kGroup + by); ++i) {
    const auto place = static_cast<std::size_t>(i);
    const auto otherPlace = static_cast<std::size_t>(i - by);
    if (one.coverage.at(place) != 0 && other.coverage.at(otherPlace) != 0) return true;
  }
  return false;
}

// Whether groups of one row do; `by` is how far the places of the other ones begin to the right.
bool overlap(std::span<const CoveredGroup> ones, std::span<const CoveredGroup> others, int by) {
  auto other = others.begin();
  for (const CoveredGroup& one : ones) {
    while (other != others.end() && other->x + by + kGroup <= one.x) ++other;
    for (auto each = other; each != others.end() && each->x + by < one.x + kGroup; ++each) {
      if (overlap(one, *each, each->x + by - one.x)) return true;
    }
  }
  return false;
}

}  // namespace

GlyphImage::GlyphImage(std::span<const uint8_t> coverage, const Pixels& bounds)
    : box(inked(coverage, bounds)) {
  rows.push_back(0);
  for (int y = 0; y < box.height; ++y) {
    const int first = (box.y - bounds.y + y) * bounds.width + box.x - bounds.x;
    const auto row =
        coverage.subspan(static_cast<std::size_t>(first), static_cast<std::size_t>(box.width));
    for (std::size_t x = 0; x < row.size(); ++x) {
      if (row[x] == 0) continue;
      CoveredGroup group = {static_cast<uint16_t>(x), {}};
      std::ranges::copy(row.subspan(x, std::min<std::size_t>(kGroup, row.size() - x)),
                        group.coverage.begin());
      groups.push_back(group);
      x += kGroup - 1;
    }
    rows.push_back(static_cast<uint32_t>(groups.size()));
  }
  groups.shrink_to_fit();
  rows.shrink_to_fit();
}

void GlyphImage::draw(const Canvas& canvas, const PixelPlace& corner, Ink& ink,
                      const Pixels& clip) {
  const int first = std::max(clip.y - corner.y, 0);
  const int last = std::min(clip.y + clip.height - corner.y, box.height);
  const int right = corner.x + box.width + kGroup;
  if (first >= last || right <= clip.x || corner.x >= clip.x + clip.width) return;
  if (corner.x >= clip.x && right <= clip.x + clip.width) {
    const auto count = static_cast<std::size_t>(last - first);
    const auto starts = std::span(rows).subspan(static_cast<std::size_t>(first), count + 1);
    uint32_t* const left = canvas.row(corner.y + first) + corner.x;
    return ink.lay(left, canvas.row(1) - canvas.row(0), {groups, starts}, tint);
  }
  for (int y = first; y < last; ++y) {
    drawRow({canvas.row(corner.y + y), corner.x, clip.x, clip.x + clip.width},
            row(static_cast<std::size_t>(y)), ink);
  }
}

bool sharePixels(const PlacedImage& one, const PlacedImage& other) {
  const Pixels common = within(one.area(), other.area());
  const auto rowAt = [](const PlacedImage& placed, int y) {
    return placed.image->row(static_cast<std::size_t>(y - placed.corner.y));
  };
  for (int y = common.y; y < common.y + common.height; ++y) {
    if (overlap(rowAt(one, y), rowAt(other, y), other.corner.x - one.corner.x)) return true;
  }
  return false;
}

}  // namespace brimol::pc
