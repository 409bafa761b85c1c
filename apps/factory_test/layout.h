/// Where things stand on the screens of the application.
#pragma once

#include <MW/records.h>
#include <brimol/scene.h>

#include "screen_size.h"

namespace factory_test {

inline constexpr uint32_t kGroundColor = 0xFF1E2430;
inline constexpr uint32_t kTitleColor = 0xFF2F5D8A;
inline constexpr uint32_t kLineColor = 0xFFE8ECF2;
inline constexpr uint32_t kButtonColor = 0xFFB8C4D6;
inline constexpr uint32_t kRowColor = 0xFF606060;
inline constexpr uint32_t kPassColor = 0xFF286E46;
inline constexpr uint32_t kFailColor = 0xFFA63A3A;

constexpr int percentOf(int length, int percent) {
  constexpr int kWhole = 100;
  return static_cast<int>(int64_t{length} * percent / kWhole);
}

/// The screen as the toolkit knows it.
ScreenSize screenSize();

/// Pixels of so many millimetres, at least `least` and at most `most`.
int pixelsOf(double millimetres, int least, int most);

/// A fiftieth of the screen's height, or more where that could not be read.
int textSize(ScreenSize screen);
/// Of long texts.
int smallTextSize(ScreenSize screen);

/// A row of the screen between the side margins, in per cent of the screen's height.
constexpr SKIA_Rect rowOf(ScreenSize screen, int topPercent, int heightPercent, uint32_t color) {
  constexpr int kMarginPercent = 5;
  const int margin = percentOf(screen.width, kMarginPercent);
  return {margin, percentOf(screen.height, topPercent), screen.width - 2 * margin,
          percentOf(screen.height, heightPercent), color};
}

/// The part of a row at `column` of `columns`, which gaps divide.
constexpr SKIA_Rect cellOf(const SKIA_Rect& row, int column, int columns) {
  constexpr int kGapPercent = 4;
  const int gap = percentOf(row.w, kGapPercent);
  const int width = (row.w - gap * (columns - 1)) / columns;
  return {row.x + column * (width + gap), row.y, width, row.h, row.color};
}
static_assert(cellOf({100, 0, 1000, 50, 0}, 1, 2).x == 620);

/// Cells of equal size in rows, in per cent of the screen's height.
struct Grid {
  int top;
  int pitch;
  int height;
  int columns;
};

constexpr SKIA_Rect cellOf(ScreenSize screen, const Grid& grid, int index, uint32_t color) {
  const int row = index / grid.columns;
  return cellOf(rowOf(screen, grid.top + row * grid.pitch, grid.height, color),
                index % grid.columns, grid.columns);
}

inline constexpr Grid kButtonGrid = {50, 12, 11, 3};
inline constexpr Grid kKeyGrid = {34, 8, 7, 3};

/// A row of the menu between its entries, in per cent of the screen's height.
inline constexpr int kGroupPercent = 3;

/// What a finger hits on every screen: 6 per cent of its height, or more where that is too low.
int entryHeight(ScreenSize screen);

/// What every test's page has above its own content, which begins at kContentTop per cent.
struct PageLayout {
  SKIA_Rect ground;
  SKIA_Rect title;
  SKIA_Rect hint;
  SKIA_Rect line;
};

inline constexpr int kContentTop = 34;

constexpr PageLayout layOutPage(ScreenSize screen) {
  return {
      .ground = {0, 0, screen.width, screen.height, kGroundColor},
      .title = rowOf(screen, 1, 6, kTitleColor),
      .hint = rowOf(screen, 10, 13, 0),
      .line = rowOf(screen, 25, 7, kLineColor),
  };
}

/// A text record for `words`; what does not fit is cut.
SKIA_Text textOf(const char* words, uint32_t color, int align, int size);

/// The same as what stands on a button or a line: black, centred, in the screen's text size.
SKIA_Text captionOf(const char* words, uint32_t color = MW::kColorBlack);

}  // namespace factory_test
