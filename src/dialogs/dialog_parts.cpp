#include "dialogs/dialog_parts.h"

#include <MW/window.h>

#include <cstring>

namespace MW {

namespace {
constexpr int64_t kTitleMarginX = 20;  // pixels, and so the rest
constexpr int64_t kTitleMarginY = 10;
constexpr int64_t kFaceMarginX = 10;
constexpr int64_t kFaceMarginY = 5;
constexpr int kFaceLoss = 15;  // what the margins take from half of the width
constexpr int kCaptionPercent = 35;
constexpr int64_t kTextMargin = 10;
}  // namespace

void layOutFrame(DialogFrame& dialog, ScreenSize screen, const DialogGrid& grid) {
  const auto [x, y, w, row, body, height] = grid;
  dialog.backdrop = overScreen(screen, dialog.backdrop.color);
  dialog.frame = makeRect(x, y, w, height, kColorGrey);
  dialog.titleBar = makeRect(x + 1, y + 1, w - 2, row, kColorBlack);
  dialog.titleArea = makeRect(x + kTitleMarginX, y + kTitleMarginY, w - 2 * kTitleMarginX,
                              row - 2 * kTitleMarginY, 0);
  dialog.body = makeRect(x + 1, y + row + 1, w - 2, body - 2, kColorBlack);
  const int32_t lineY = toPixels(y + 1 + row);
  dialog.separator = {toPixels(x + 1), lineY, toPixels(x + 1 + w - 2), lineY, kColorHighlight, 1};
}

void styleTitle(SKIA_Text& title, int align) {
  title.color = kColorHighlight;
  title.align = align;
  title.size = kDialogTitleSize;
}

SKIA_Rect messageArea(const DialogGrid& grid) {
  return makeRect(grid.x + kTextMargin, grid.y + grid.row + kTextMargin, grid.w - 2 * kTextMargin,
                  grid.row - 2 * kTextMargin, 0);
}

void placeButton(DialogButton& button, const DialogGrid& grid, const SKIA_Rect& face) {
  button.face = face;
  button.border = grown(face, 1, kColorBlack);
  button.caption.color = kColorBlack;
  button.caption.align = SKIA_ALIGN_CENTRE;
  button.caption.size = captionSize(grid);
}

int captionSize(const DialogGrid& grid) { return toPixels(percentOf(grid.row, kCaptionPercent)); }

SKIA_Rect leftFace(const DialogGrid& grid) {
  return makeRect(grid.x + kFaceMarginX, grid.y + grid.row + grid.body + kFaceMarginY,
                  grid.w / 2 - kFaceLoss, grid.row - 2 * kFaceMarginY, kColorWhite);
}

SKIA_Rect rightFace(const DialogGrid& grid) {
  SKIA_Rect face = leftFace(grid);
  face.x = toPixels(grid.x + face.w + 2 * kFaceMarginX);
  return face;
}

SKIA_Rect wideFace(const DialogGrid& grid) {
  SKIA_Rect face = leftFace(grid);
  face.w = toPixels(grid.w - 2 * kFaceMarginX);
  return face;
}

void drawFrame(const DialogFrame& dialog) {
  skia_add_box_c(dialog.backdrop);
  skia_add_box_c(dialog.frame);
  skia_add_box_c(dialog.titleBar);
  skia_add_box_c(dialog.body);
  skia_add_line_c(dialog.separator);
  skia_add_label_c(dialog.titleArea, dialog.title);
}

void drawButton(const DialogButton& button) {
  skia_add_roundbox_c(button.border);
  skia_add_roundtextbox_c(button.face, button.caption);
}

std::optional<std::string_view> wholeText(const char* given, std::size_t limit) {
  if (given == nullptr) return std::nullopt;
  const std::string_view found(given, strnlen(given, limit + 1));
  if (found.size() > limit) return std::nullopt;
  return found;
}

}  // namespace MW
