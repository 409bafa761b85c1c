#include <MW/button3.h>
#include <MW/window.h>

#include <algorithm>
#include <array>
#include <cstring>

#include "core/bounded_text.h"
#include "core/geometry.h"
#include "core/pass_time.h"
#include "core/present_screen.h"

namespace MW {

namespace {

enum class Column { Left, Centre, Right };
enum class Row { Top, Middle, Bottom };

struct Cell {
  Button3::Position position;
  Column column;
  Row row;
};

// A position that is not in the table is no cell.
constexpr auto kCells = std::to_array<Cell>({
    {Button3::kBottomLeft, Column::Left, Row::Bottom},
    {Button3::kBottomRight, Column::Right, Row::Bottom},
    {Button3::kBottomCentre, Column::Centre, Row::Bottom},
    {Button3::kMiddleLeft, Column::Left, Row::Middle},
    {Button3::kMiddleRight, Column::Right, Row::Middle},
    {Button3::kMiddleCentre, Column::Centre, Row::Middle},
    {Button3::kTopLeft, Column::Left, Row::Top},
    {Button3::kTopRight, Column::Right, Row::Top},
    {Button3::kTopCentre, Column::Centre, Row::Top},
});

// Three squares and four gaps fill the width, reckoned in thousandths of a pixel.
struct Grid {
  int64_t gap;
  int64_t side;
};

constexpr Grid layOutGrid(int screenWidth) {
  constexpr int64_t kScale = 1000;
  constexpr int64_t kUnits = 200;  // to the screen's width
  constexpr int64_t kGapUnits = 4;
  constexpr int64_t kGaps = 4;
  constexpr int64_t kSquares = 3;
  const int64_t unit = kScale * screenWidth / kUnits;
  const int64_t side = (kScale * screenWidth - kGaps * kGapUnits * unit) / kSquares;
  return {unit * kGapUnits / kScale, side / kScale};
}
static_assert(layOutGrid(1080).gap == 21 && layOutGrid(1080).side == 331);

constexpr int64_t leftOf(Column column, const Grid& grid) {
  switch (column) {
    case Column::Left: return grid.gap;
    case Column::Centre: return grid.side + 2 * grid.gap;
    case Column::Right: break;
  }
  return 3 * grid.gap + 2 * grid.side;
}
static_assert(leftOf(Column::Centre, layOutGrid(1080)) == 373);
static_assert(leftOf(Column::Right, layOutGrid(1080)) == 725);

constexpr int64_t topOf(Row row, const Grid& grid, int screenHeight, int bottomOffset) {
  switch (row) {
    case Row::Top: return grid.gap;
    case Row::Middle: return screenHeight / 2 - grid.side / 2;
    case Row::Bottom: break;
  }
  return screenHeight - grid.side - grid.gap - bottomOffset;
}

constexpr const char* verdictOf(int position) {
  if (position == Button3::kBottomLeft) return "PASS";
  return position == Button3::kBottomCentre ? "RETRY" : "FAIL";
}

SKIA_Text captionOf(const char* words) {
  SKIA_Text caption = {};
  putText(caption, words);
  return caption;
}

}  // namespace

// The array lives until the delegation is over.
Button3::Button3(int position)
    : Button3(position, std::array{captionOf(verdictOf(position))}.data()) {}

Button3::Button3(int position, const SKIA_Text* first) : Button3(position, first, nullptr, 0) {}

Button3::Button3(int position, const SKIA_Text* first, int bottom)
    : Button3(position, first, nullptr, bottom) {}

Button3::Button3(int position, const SKIA_Text* first, const SKIA_Text* second, int bottom)
    : PushButton("BUTTON3", nullptr, nullptr) {
  init(position, first, second, bottom);
}

Button3::~Button3() { leaveLayers(); }

int Button3::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (!drawsAt(delayedShow, ticks)) return 1;
  skia_add_buttonbox_c(rect, text);
  if (captionCount > 0) skia_add_label_c(labelRect1, caption1);
  if (captionCount > 1) skia_add_label_c(labelRect2, caption2);
  return 1;
}

char* Button3::getText() { return caption1.text; }
unsigned int Button3::getTextColor() { return read(caption1.color); }
int Button3::getFontSize() { return read(caption1.size); }
void Button3::setFontSize(int pixels) { write(caption1.size, pixels); }
void Button3::setTextColor(unsigned int color) { write(caption1.color, color); }

// The new length goes to the button box's own text, which is empty; the caption keeps the length of
// its construction.
void Button3::setText(const char* newText) {
  const std::string_view given = boundedText(newText);
  const std::lock_guard guard(stateLock);
  text.string_len = static_cast<int32_t>(given.size());
  const auto length = static_cast<std::size_t>(caption1.string_len);
  const std::string_view kept = cutText(given, length);
  std::memmove(caption1.text, kept.data(), kept.size());  // which may be the caption itself
  std::memset(caption1.text + kept.size(), 0, length + 1 - kept.size());
}

void Button3::setRect(int position, const SKIA_Rect*) {
  const ScreenSize screen = presentScreen();
  const Grid grid = layOutGrid(screen.w);
  const auto* const cell = std::ranges::find(kCells, position, &Cell::position);
  const std::lock_guard guard(stateLock);
  if (cell != kCells.end()) {
    rect = makeRect(leftOf(cell->column, grid), topOf(cell->row, grid, screen.h, bottomOffset),
                    grid.side, grid.side, rect.color);
  }
  placeLabels();
  normalColor = kColorWhite;
  rect.color = kColorWhite;
}

void Button3::init(int position, const SKIA_Text* first, const SKIA_Text* second, int bottom) {
  setActive(0);
  setType(kBaseLayer);
  {
    const std::lock_guard guard(stateLock);
    bottomOffset = bottom;
    captionCount = second != nullptr ? 2 : first != nullptr ? 1 : 0;
    text = {{}, 0, kColorBlue, 0, 0};  // the button box's own text, which stays empty
    caption1 = copyText(first);
    caption2 = copyText(second);
    delayedShow = DelayedShow();
  }
  Button3::setRect(position, &rect);
  pressCallback = clickCallback = longPressCallback = doubleClickCallback = nullptr;
  clicks.reset();
  Window::registerWidget(this);
}

void Button3::placeLabels() {
  const int half = rect.h / 2;
  const int height = captionCount == 2 ? half : rect.h;
  labelRect1 = {rect.x, rect.y, rect.w, height, labelRect1.color};
  if (captionCount < 2) return;
  labelRect2 = makeRect(rect.x, int64_t{rect.y} + half, rect.w, half, labelRect2.color);
}

}  // namespace MW
