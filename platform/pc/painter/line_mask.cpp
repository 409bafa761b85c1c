#include "painter/line_mask.h"

#include <algorithm>
#include <numeric>

namespace brimol::pc {

namespace {

constexpr int kGroup = CoveredGroup::kPixels;

// A row of the canvas, and where in it the mask begins and the clip lies.
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

// Visits a part's rows by their numbers in the mask.
template <typename Work>
void eachRow(const LineMask::Part& part, const Pixels& area, Work work) {
  const auto first = static_cast<std::size_t>(part.area.y - area.y);
  for (std::size_t y = 0; y < static_cast<std::size_t>(part.area.height); ++y) {
    work(first + y, part.image->row(y));
  }
}

}  // namespace

// First how many groups each row has, then where they begin, then the groups.
LineMask::LineMask(std::span<const Part> parts, const Pixels& area)
    : box(area), rows(static_cast<std::size_t>(area.height) + 1) {
  for (const Part& part : parts) {
    eachRow(part, area, [this](std::size_t row, std::span<const CoveredGroup> more) {
      rows[row + 1] += static_cast<uint32_t>(more.size());
    });
  }
  std::partial_sum(rows.begin(), rows.end(), rows.begin());
  groups.resize(rows.back());
  std::vector<uint32_t> next(rows.begin(), rows.end() - 1);
  for (const Part& part : parts) {
    const auto toRight = [by = part.area.x - area.x](const CoveredGroup& group) {
      return CoveredGroup{static_cast<uint16_t>(group.x + by), group.coverage};
    };
    eachRow(part, area, [&](std::size_t row, std::span<const CoveredGroup> more) {
      std::ranges::transform(more, groups.begin() + next[row], toRight);
      next[row] += static_cast<uint32_t>(more.size());
    });
  }
}

void LineMask::draw(const Canvas& canvas, const Place& origin, Ink& ink, const Pixels& clip) const {
  const int left = origin.x + box.x;
  const int top = origin.y + box.y;
  const int first = std::max(clip.y - top, 0);
  const int last = std::min(clip.y + clip.height - top, box.height);
  const bool isWhole = left >= clip.x && left + box.width + kGroup <= clip.x + clip.width;
  for (int line = first; line < last; ++line) {
    const auto number = static_cast<std::size_t>(line);
    const std::span shown(groups.data() + rows[number], groups.data() + rows[number + 1]);
    uint32_t* const pixels = canvas.row(top + line);
    if (isWhole) {
      ink.lay(pixels, left, shown);
    } else {
      drawRow({pixels, left, clip.x, clip.x + clip.width}, shown, ink);
    }
  }
}

}  // namespace brimol::pc
