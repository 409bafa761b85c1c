/// Where things stand on the screens of the application.
#pragma once

#include <MW/records.h>
#include <brimol/scene.h>

#include <algorithm>
#include <array>
#include <numeric>
#include <span>
#include <string_view>

#include "look.h"
#include "screen_size.h"

namespace factory_test {

constexpr int percentOf(int length, int percent) {
  constexpr int kWhole = 100;
  return static_cast<int>(int64_t{length} * percent / kWhole);
}

/// The screen as the toolkit knows it.
ScreenSize screenSize();

/// Whether the platform knows the density of its display.
bool isDensityKnown();

/// Of the display; of a usual phone where the density is unknown.
double pixelsPerMillimetre();

/// Pixels of so many millimetres, at least `least` and at most `most`.
int pixelsOf(double millimetres, int least, int most);

/// What is read at arm's length: a fiftieth of the screen's longer side, or more on a small screen.
int textSize(ScreenSize screen);
/// Of long texts.
int smallTextSize(ScreenSize screen);

constexpr bool isLandscape(ScreenSize screen) { return screen.width > screen.height; }

/// Between things that belong together, and twice as much around them.
constexpr int gapOf(ScreenSize screen) {
  constexpr int kParts = 50;
  return std::min(screen.width, screen.height) / kParts;
}

/// What is left of an area within a margin.
constexpr SKIA_Rect within(const SKIA_Rect& area, int margin) {
  return {area.x + margin, area.y + margin, area.w - 2 * margin, area.h - 2 * margin, area.color};
}

constexpr SKIA_Rect inColor(SKIA_Rect area, uint32_t color) {
  area.color = color;
  return area;
}

struct Stretch {
  int from;
  int length;
};

/// Of a length that gaps divide by weights, the part of that number.
constexpr Stretch partOf(int length, int gap, std::span<const int> weights, std::size_t index) {
  const auto upTo = [&](std::size_t count) {
    return std::accumulate(weights.begin(), weights.begin() + static_cast<std::ptrdiff_t>(count),
                           int64_t{0});
  };
  const int gaps = static_cast<int>(weights.size()) - 1;
  const int64_t free = std::max(length - gap * gaps, 0);
  const auto edge = [&](std::size_t count) {
    return static_cast<int>(free * upTo(count) / std::max(upTo(weights.size()), int64_t{1}));
  };
  return {edge(index) + gap * static_cast<int>(index), edge(index + 1) - edge(index)};
}

/// The parts of an area one above the other.
template <std::size_t count>
constexpr std::array<SKIA_Rect, count> rowsOf(const SKIA_Rect& area, int gap,
                                              const std::array<int, count>& weights) {
  std::array<SKIA_Rect, count> rows = {};
  for (std::size_t i = 0; i < count; ++i) {
    const Stretch part = partOf(area.h, gap, weights, i);
    rows.at(i) = {area.x, area.y + part.from, area.w, part.length, area.color};
  }
  return rows;
}
static_assert(rowsOf<2>({0, 100, 40, 310, 0}, 10, {1, 2})[1].y == 210);

/// The parts of an area side by side.
template <std::size_t count>
constexpr std::array<SKIA_Rect, count> columnsOf(const SKIA_Rect& area, int gap,
                                                 const std::array<int, count>& weights) {
  std::array<SKIA_Rect, count> columns = {};
  for (std::size_t i = 0; i < count; ++i) {
    const Stretch part = partOf(area.w, gap, weights, i);
    columns.at(i) = {area.x + part.from, area.y, part.length, area.h, area.color};
  }
  return columns;
}

/// A cell of a grid of equal ones, numbered row by row.
struct Grid {
  int rows;
  int columns;
};

constexpr SKIA_Rect cellOf(const SKIA_Rect& area, int gap, const Grid& grid, int index) {
  const auto edge = [&](int length, int parts, int part) {
    return static_cast<int>(int64_t{length - gap * (parts - 1)} * part / parts);
  };
  const int row = index / grid.columns;
  const int column = index % grid.columns;
  const int x = edge(area.w, grid.columns, column);
  const int y = edge(area.h, grid.rows, row);
  return {area.x + x + gap * column, area.y + y + gap * row,
          edge(area.w, grid.columns, column + 1) - x, edge(area.h, grid.rows, row + 1) - y,
          area.color};
}
static_assert(cellOf({100, 0, 1000, 50, 0}, 40, {1, 2}, 1).x == 620);

/// A row of the menu between its entries.
int groupHeight(ScreenSize screen);

/// What a finger hits on every screen: 6 per cent of its longer side, or more where that is too
/// low.
int entryHeight(ScreenSize screen);

/// What every page is made of.
struct PageLayout {
  SKIA_Rect ground;
  SKIA_Rect head;                     ///< the bar of the title
  SKIA_Rect leave;                    ///< the way out, in it
  SKIA_Rect progress;                 ///< at its foot
  SKIA_Rect title;                    ///< the same
  SKIA_Rect whose;                    ///< which unit, behind the title
  SKIA_Rect hint;                     ///< what to do
  SKIA_Rect line;                     ///< what happens
  SKIA_Rect content;                  ///< the page's own
  std::array<SKIA_Rect, 3> verdicts;  ///< from left to right, or from the top
};

constexpr PageLayout layOutPage(ScreenSize screen) {
  const int gap = gapOf(screen);
  const SKIA_Rect whole = {0, 0, screen.width, screen.height, kPageInk.ground};
  const bool isWide = isLandscape(screen);
  const auto [head, rest] = rowsOf<2>(whole, 0, isWide ? std::array{10, 90} : std::array{9, 91});
  const auto [leave, title, whose] = columnsOf<3>(inColor(head, kHeadInk.ground), gap, {3, 8, 3});
  const SKIA_Rect body = within(rest, 2 * gap);
  PageLayout page = {.ground = whole,
                     .head = inColor(head, kHeadInk.ground),
                     .leave = inColor(rowsOf<2>(leave, 0, {11, 1})[0], kButtonInk.ground),
                     .progress = rowsOf<2>(head, 0, {11, 1})[1],
                     .title = title,
                     .whose = inColor(rowsOf<2>(whose, 0, {11, 1})[0], kHeadInk.ground),
                     .hint = {},
                     .line = {},
                     .content = {},
                     .verdicts = {}};
  if (isWide) {
    const auto [left, right] = columnsOf<2>(body, 2 * gap, {4, 1});
    const auto [hint, line, content] = rowsOf<3>(left, gap, {20, 7, 73});
    page.hint = hint;
    page.line = inColor(line, kPanelInk.ground);
    page.content = content;
    page.verdicts = rowsOf<3>(right, 2 * gap, {1, 1, 1});
    return page;
  }
  const auto [hint, line, content, verdicts] = rowsOf<4>(body, gap, {12, 7, 68, 13});
  page.hint = hint;
  page.line = inColor(line, kPanelInk.ground);
  page.content = content;
  page.verdicts = columnsOf<3>(verdicts, gap, {1, 1, 1});
  return page;
}

/// The part of the present screen that is a page's own.
SKIA_Rect contentArea();

/// A text record for `words`; what does not fit is cut.
SKIA_Text textOf(const char* words, uint32_t color, int align, int size);

/// The same as what stands on a button or a line: black, centred, in the screen's text size.
SKIA_Text captionOf(const char* words, uint32_t color = kDark);
/// The same in the lines and the size in which it has room in the area.
SKIA_Text captionIn(const SKIA_Rect& area, const char* words, uint32_t color = kDark);
SKIA_Text captionIn(const SKIA_Rect& area, const char* words, uint32_t color, int size);

/// Where lines begin in the present language.
int leadingAlign();

/// Draws the words in lines that have room in the area, in its middle's height, in letters of at
/// most `size`. On the thread that draws.
void drawWords(const SKIA_Rect& area, std::string_view words, uint32_t color, int align, int size);

}  // namespace factory_test
