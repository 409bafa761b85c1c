/// Where everything on the first screen stands.
#pragma once

#include <MW/records.h>

#include <array>
#include <cstddef>

namespace factory_test {

struct ScreenSize {
  int w;
  int h;
};

inline constexpr std::size_t kButtonCount = 6;

struct Layout {
  SKIA_Rect ground;
  SKIA_Rect title;
  SKIA_Rect status;
  SKIA_Rect label;
  SKIA_Rect picture;
  SKIA_Rect box;
  SKIA_Point line;
  std::array<SKIA_Rect, kButtonCount> buttons;  // two a row
  SKIA_Rect end;
  int titleSize;  // font sizes in pixels
  int textSize;
};

namespace detail {

inline constexpr uint32_t kGround = 0xFF1E2430;
inline constexpr uint32_t kTitleFill = 0xFF2F5D8A;
inline constexpr uint32_t kStatusFill = 0xFFE8ECF2;
inline constexpr uint32_t kButtonFill = 0xFFB8C4D6;
inline constexpr uint32_t kEndFill = 0xFFE0A8A0;
inline constexpr uint32_t kLineColor = 0xFF4C5870;
inline constexpr int kPercent = 100;

constexpr int percentOf(int length, int percent) {
  return static_cast<int>(int64_t{length} * percent / kPercent);
}

/// A row of the screen between the side margins, given in per cent of the screen's height.
constexpr SKIA_Rect rowOf(ScreenSize screen, int topPercent, int heightPercent, uint32_t color) {
  constexpr int kMarginPercent = 5;
  const int margin = percentOf(screen.w, kMarginPercent);
  return {margin, percentOf(screen.h, topPercent), screen.w - 2 * margin,
          percentOf(screen.h, heightPercent), color};
}

/// The part of a row at `column` of `columns` that a gap divides.
constexpr SKIA_Rect cellOf(const SKIA_Rect& row, int column, int columns) {
  constexpr int kGapPercent = 4;
  const int gap = percentOf(row.w, kGapPercent);
  const int width = (row.w - gap * (columns - 1)) / columns;
  return {row.x + column * (width + gap), row.y, width, row.h, row.color};
}

}  // namespace detail

constexpr Layout layOut(ScreenSize screen) {
  using namespace detail;
  constexpr int kButtonTop = 42;  // the rest in per cent of the screen's height, too
  constexpr int kButtonPitch = 13;
  constexpr int kButtonHeight = 10;
  constexpr int kColumns = 2;
  constexpr int kPrimitives = 3;
  const SKIA_Rect primitives = rowOf(screen, 23, 14, MW::kColorWhite);
  const SKIA_Rect ruler = rowOf(screen, 39, 1, kLineColor);
  Layout layout = {
      .ground = {0, 0, screen.w, screen.h, kGround},
      .title = rowOf(screen, 3, 7, kTitleFill),
      .status = rowOf(screen, 12, 8, kStatusFill),
      .label = cellOf(primitives, 0, kPrimitives),
      .picture = cellOf(primitives, 1, kPrimitives),
      .box = cellOf(primitives, 2, kPrimitives),
      .line = {ruler.x, ruler.y, ruler.x + ruler.w, ruler.y, kLineColor, screen.h / 400},
      .buttons = {},
      .end = rowOf(screen, 84, 12, kEndFill),
      .titleSize = screen.h / 36,
      .textSize = screen.h / 50,
  };
  for (std::size_t i = 0; i < kButtonCount; ++i) {
    const int number = static_cast<int>(i);
    const SKIA_Rect row =
        rowOf(screen, kButtonTop + number / kColumns * kButtonPitch, kButtonHeight, kButtonFill);
    layout.buttons.at(i) = cellOf(row, number % kColumns, kColumns);
  }
  return layout;
}

}  // namespace factory_test
