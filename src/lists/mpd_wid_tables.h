/// What the rows of the list of results look like, and where their cells stand.
#pragma once

#include <MW/records.h>

#include <array>

#include "core/geometry.h"

namespace MW {

constexpr int kMargin = 20;         // pixels, left and right of the list
constexpr int kFirstCellTop = 340;  // until a row is drawn

struct Marker {
  const char* words;
  uint32_t color;  // of the first two cells; 0: the row's
};
constexpr Marker kLeaf = {"[*]", 0};
constexpr Marker kCollapsed = {"[>]", 0xFFFFFF00};
constexpr Marker kExpanded = {"[V]", kColorGreen};

struct LevelColor {
  int level;
  uint32_t color;
};

// A level that is not here leaves the colour as it was.
constexpr auto kLevelColors = std::to_array<LevelColor>({
    {1, kColorGrey},
    {2, 0xFFFFA873},
    {3, 0xFFFF6600},
});

// Five cells of so many twentieths of the list's width, a pixel apart.
constexpr std::array<int, 5> kCellParts = {1, 1, 6, 4, 8};
constexpr int kAllParts = 20;

constexpr std::array<SKIA_Rect, 5> layOutCells(int screenWidth) {
  const int64_t width = int64_t{screenWidth} - int64_t{2} * kMargin;
  std::array<SKIA_Rect, 5> cells = {};
  int64_t x = kMargin;
  for (std::size_t i = 0; i < cells.size(); ++i) {
    const int64_t gap = i == 0 ? 0 : 1;
    cells.at(i) =
        makeRect(x + gap, kFirstCellTop, kCellParts.at(i) * width / kAllParts - gap, 0, 0);
    x = int64_t{cells.at(i).x} + cells.at(i).w;
  }
  return cells;
}
static_assert(layOutCells(1080)[0].x == 20 && layOutCells(1080)[0].w == 52);
static_assert(layOutCells(1080)[1].x == 73 && layOutCells(1080)[1].w == 51);
static_assert(layOutCells(1080)[4].x == 645 && layOutCells(1080)[4].w == 415);

}  // namespace MW
