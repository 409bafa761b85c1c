/// The geometry and the drawing that the dialogs share.
#pragma once

#include <MW/detail/dialog_frame.h>

#include <algorithm>
#include <optional>
#include <string_view>

#include "core/bounded_text.h"
#include "core/geometry.h"
#include "core/present_screen.h"

namespace MW {

constexpr int kDialogTitleSize = 70;  // pixels
constexpr int kDialogTextSize = 60;   // pixels

/// A dialog on its screen: four fifths of the shorter side wide, a fifth of that the height of a
/// row. The title has a row, and so have the buttons below the body.
struct DialogGrid {
  int64_t x;
  int64_t y;
  int64_t w;
  int64_t row;
  int64_t body;  // its height
  int64_t height;
};

constexpr int64_t shorterSide(ScreenSize screen) { return std::min(screen.w, screen.h); }

constexpr int64_t dialogWidth(ScreenSize screen) {
  constexpr int kWidthPercent = 80;
  return percentOf(shorterSide(screen), kWidthPercent);
}

constexpr int64_t rowHeight(ScreenSize screen) {
  constexpr int kTenths = 10;
  constexpr int kRowTenths = 50;
  return dialogWidth(screen) * kTenths / kRowTenths;
}

/// The grid of a dialog with a body of `body` pixels and `otherRows` rows above and below it.
constexpr DialogGrid layOutAround(ScreenSize screen, int64_t body, int otherRows) {
  const int64_t w = dialogWidth(screen);
  const int64_t row = rowHeight(screen);
  const int64_t height = body + row * otherRows;
  return {(screen.w - w) / 2, (screen.h - height) / 2, w, row, body, height};
}

/// The grid of a dialog with a body of one row. `rows`: 3 with buttons, 2 without.
constexpr DialogGrid layOutGrid(ScreenSize screen, int rows) {
  return layOutAround(screen, rowHeight(screen), rows - 1);
}
static_assert(layOutGrid({1440, 2560}, 3).w == 1152 && layOutGrid({1440, 2560}, 3).row == 230);
static_assert(layOutGrid({1440, 2560}, 3).x == 144 && layOutGrid({1440, 2560}, 3).y == 935);

/// Places the frame, the title and a black body. The title's text and look and the backdrop's
/// colour stay.
void layOutFrame(DialogFrame& dialog, ScreenSize screen, const DialogGrid& grid);
/// Gives a text its look; what it says stays.
constexpr void style(SKIA_Text& words, uint32_t color, int align, int size) {
  words.color = color;
  words.align = align;
  words.size = size;
}
/// Gives a title the standard look.
void styleTitle(SKIA_Text& title, int align);

/// The place of a message that is alone in the body.
SKIA_Rect messageArea(const DialogGrid& grid);

/// Gives a button its face, a border one pixel around it, and its caption's look.
void placeButton(DialogButton& button, const DialogGrid& grid, const SKIA_Rect& face);
/// The text size of captions.
int captionSize(const DialogGrid& grid);

/// White faces of two buttons side by side, and of one as wide as both.
SKIA_Rect leftFace(const DialogGrid& grid);
SKIA_Rect rightFace(const DialogGrid& grid);
SKIA_Rect wideFace(const DialogGrid& grid);

/// Draws everything up to the title.
void drawFrame(const DialogFrame& dialog);
void drawButton(const DialogButton& button);

/// The most bytes of a line in a list or a console. A longer one is refused as a whole.
inline constexpr std::size_t kLongestLine = kTextMax - 1;

/// A C string of at most `limit` bytes. None: it is longer, or null. No byte behind the first
/// `limit` + 1 is read.
std::optional<std::string_view> wholeText(const char* given, std::size_t limit);

}  // namespace MW
