/// The geometry and the drawing that the dialogs share.
#pragma once

#include <MW/detail/dialog_frame.h>

#include "core/geometry.h"

namespace MW {

constexpr uint32_t kDialogFrameColor = 0xFFBFBFBF;
constexpr uint32_t kDialogTitleColor = kColorHighlight;
constexpr uint32_t kAlarmColor = 0xFFFF0000;
constexpr int kDialogTitleSize = 70;  // pixels
constexpr int kDialogTextSize = 60;   // pixels

/// A dialog on its screen: four fifths of the shorter side wide, a fifth of that the height of a
/// row. Rows of that height are the title, the body of the simple dialogs, and the buttons.
struct DialogGrid {
  int64_t x;
  int64_t y;
  int64_t w;
  int64_t row;
  int64_t height;
};

constexpr DialogGrid layOutGrid(ScreenSize screen, int rows) {
  constexpr int kWidthPercent = 80;
  constexpr int kTenths = 10;
  constexpr int kRowTenths = 50;
  const int64_t w = percentOf(screen.w < screen.h ? screen.w : screen.h, kWidthPercent);
  const int64_t row = w * kTenths / kRowTenths;
  const int64_t height = row * rows;
  return {(screen.w - w) / 2, (screen.h - height) / 2, w, row, height};
}
static_assert(layOutGrid({1440, 2560}, 3).w == 1152 && layOutGrid({1440, 2560}, 3).row == 230);
static_assert(layOutGrid({1440, 2560}, 3).x == 144 && layOutGrid({1440, 2560}, 3).y == 935);

/// The frame with a body of one row, and its title in its standard look, its text kept.
void layOutFrame(DialogFrame& dialog, ScreenSize screen, const DialogGrid& grid);

/// Puts the face where it is told, in white, and the border a pixel around it.
void placeButton(DialogButton& button, const DialogGrid& grid, const SKIA_Rect& face);

/// The faces of two buttons side by side, and of one as wide as both.
SKIA_Rect leftFace(const DialogGrid& grid);
SKIA_Rect rightFace(const DialogGrid& grid);
SKIA_Rect wideFace(const DialogGrid& grid);

/// The frame's boxes and its line, up to the title, in their order.
void drawFrame(const DialogFrame& dialog);
void drawButton(const DialogButton& button);

}  // namespace MW
