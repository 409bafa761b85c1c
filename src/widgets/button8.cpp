#include <MW/button8.h>

#include <algorithm>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"
#include "core/hit_test.h"

namespace MW {

namespace {

constexpr int kMarkSize = 60;   // pixels
constexpr int kFrameWidth = 1;  // pixels
constexpr double kGapPercent = 3.0;
constexpr double kWhole = 100.0;

struct Shape {
  int rows;
  int cols;
};

// By Button8::Layout.
constexpr auto kShapes = std::to_array<Shape>({{1, 1}, {2, 2}, {3, 2}, {4, 2}, {2, 3}, {2, 4}});
static_assert(std::ranges::all_of(kShapes, [](const Shape& shape) {
  return shape.rows * shape.cols <= Button8::kCells;
}));

using Cells = std::array<SKIA_Rect, Button8::kCells>;

// The longer side of the shape decides how large the squares are. Its length goes through a float,
// which rounds lengths above 2^24.
constexpr int64_t sideOf(const SKIA_Rect& area, const Shape& shape) {
  const int count = std::max(shape.rows, shape.cols);
  const int length = shape.rows <= shape.cols ? area.w : area.h;
  const auto gap = static_cast<int64_t>(static_cast<float>(length) * kGapPercent / kWhole);
  return (length - gap * (count + 1)) / count;
}

constexpr Cells layOutCells(const SKIA_Rect& area, const Shape& shape) {
  Cells cells = {};
  if (shape.rows * shape.cols == 0) return cells;
  const int64_t side = sideOf(area, shape);
  const int64_t gapX = (area.w - side * shape.cols) / (shape.cols + 1);
  const int64_t gapY = (area.h - side * shape.rows) / (shape.rows + 1);
  for (int i = 0; i < shape.rows * shape.cols; ++i) {
    const int row = i / shape.cols;
    const int col = i % shape.cols;
    cells.at(static_cast<std::size_t>(i)) =
        makeRect(area.x + col * side + gapX * (col + 1), area.y + row * side + gapY * (row + 1),
                 side, side, area.color);
  }
  return cells;
}
static_assert(layOutCells({0, 0, 400, 800, 0}, {4, 2})[0].x == 20);
static_assert(layOutCells({0, 0, 400, 800, 0}, {4, 2})[1].x == 210);
static_assert(layOutCells({0, 0, 400, 800, 0}, {4, 2})[2].y == 218);
static_assert(layOutCells({0, 0, 400, 800, 0}, {4, 2})[2].w == 170);
static_assert(layOutCells({0, 0, 400, 800, 0}, {2, 2})[0].w == 182);
static_assert(layOutCells({0, 0, 400, 800, 0}, {3, 2})[0].x == -22);  // too narrow: they overlap

template <typename Holders>
constexpr unsigned int maskOf(const Holders& holders) {
  unsigned int mask = 0;
  for (unsigned int i = 0; i < Button8::kCells; ++i) {
    if (holders.at(i) > 0) mask |= 1U << i;
  }
  return mask;
}

mouse_event withState(mouse_event mouse, unsigned int state) {
  mouse.state = state;
  return mouse;
}

}  // namespace

Button8::Button8(int layout, const SKIA_Rect* area, const SKIA_Text* caption)
    : ButtonFace("BUTTON8", area, caption) {
  cellText.fill(makeText("*", kColorBlue, SKIA_ALIGN_CENTRE, kMarkSize));
  Button8::setRect(layout, &rect);
  buttonType = layout;
  point.width = kFrameWidth;
  enterWindow(1);
}

Button8::~Button8() { leaveLayers(); }

int Button8::show() { return show(0); }

int Button8::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  for (std::size_t i = 0; i < static_cast<std::size_t>(cellCount); ++i) {
    cellRect.at(i).color = cellSelect.at(i) != 0 ? kColorRed : rect.color;
    skia_add_roundbox_c(cellRect.at(i));
    skia_add_label_c(cellRect.at(i), cellText.at(i));
  }
  return 1;
}

int Button8::hide() {
  setActive(0);
  write(cellSelect, {});
  return 1;
}

bool Button8::onRecvEvent(event_data* event, unsigned int) {
  if (!isUnder(rect, event)) return false;
  switch (event->type) {
    case kEventPress: onPress(event); return true;
    case kEventRelease: onRelease(event); return true;
    default: return false;
  }
}

void Button8::onPress(event_data* event) {
  const int cell = getButtonSelect(event);
  if (cell == kCells) return;
  const ClassLog log(word);
  const Holders held = setHolder(cell, FingerHold::wordOf(event->mouse));
  const unsigned int mask = maskOf(held);
  mouse_event told = withState(event->mouse, mask);
  pressCallback(&told);
  log.print(LogLevel::Debug, "pressed (%d) - state = %d  %01d,%01d,%01d,%01d,%01d,%01d,%01d,%01d!!",
            cell, static_cast<int>(mask), held[0], held[1], held[2], held[3], held[4], held[5],
            held[6], held[7]);
}

void Button8::onRelease(event_data* event) {
  const int cell = getButtonSelect(event);
  if (cell == kCells) return;
  const ClassLog log(word);
  const unsigned int mask = maskOf(setHolder(cell, 0));
  mouse_event told = withState(event->mouse, mask);
  clickCallback(&told);
  log.print(LogLevel::Debug, "released (%d) - state = %d !!", cell, static_cast<int>(mask));
}

Button8::Holders Button8::setHolder(int cell, int holder) {
  const std::lock_guard guard(stateLock);
  cellSelect.at(static_cast<std::size_t>(cell)) = holder;
  return cellSelect;
}

void Button8::setRect(int layout, const SKIA_Rect* newRect) {
  if (newRect == nullptr) return;
  getRowCol(layout);
  int count = 0;
  {
    const std::lock_guard guard(stateLock);
    rect = *newRect;
    cellRect = layOutCells(rect, {rows, cols});
    cellCount = count = rows * cols;
  }
  ClassLog(word).print(LogLevel::Debug, "setRect (%d)!!", count);
}

void Button8::setBgColor(unsigned int color) { write(rect.color, color); }
void Button8::setBdColor(unsigned int color) { write(point.color, color); }
void Button8::setBdWidth(int pixels) { write(point.width, pixels); }

void Button8::getRowCol(int layout) {
  if (layout < 0 || layout >= static_cast<int>(kShapes.size())) return;
  const Shape& shape = kShapes.at(static_cast<std::size_t>(layout));
  const std::lock_guard guard(stateLock);
  rows = shape.rows;
  cols = shape.cols;
}

int Button8::getButtonSelect(const event_data* event) const {
  if (event == nullptr) return kCells;
  const std::lock_guard guard(stateLock);
  for (int i = 0; i < cellCount; ++i) {
    if (containsInside(cellRect.at(static_cast<std::size_t>(i)), positionOf(*event))) return i;
  }
  return kCells;
}

}  // namespace MW
