#include "lists/row_column.h"

#include <initializer_list>

// Checked where they are compiled: where rows stand, which one lies at a height, and the scroll.

namespace {

using MW::RowColumn;

constexpr RowColumn columnOf(std::initializer_list<int> heights, int64_t top = 0, int gap = 3) {
  RowColumn column(top, gap);
  for (const int height : heights) column.add(height);
  return column;
}

constexpr RowColumn kRows = columnOf({100, 0, 50}, 340);  // 340 to 440, 443, 446 to 496
static_assert(kRows.count() == 3 && kRows.height() == 156);
static_assert(kRows.topOf(1) == 443 && kRows.topOf(3) == 499 && kRows.bottomOf(2) == 496);
static_assert(kRows.rowAt(340) == RowColumn::kNoRow && kRows.rowAt(341) == 0);
static_assert(kRows.rowAt(439) == 0 && kRows.rowAt(440) == RowColumn::kNoRow);
static_assert(kRows.rowAt(443) == RowColumn::kNoRow, "no room, no hit");
static_assert(kRows.rowAt(447) == 2 && kRows.rowAt(496) == RowColumn::kNoRow);

static_assert(columnOf({}).height() == -3 && columnOf({}).rowAt(0) == RowColumn::kNoRow);
static_assert(columnOf({1}).rowAt(0) == RowColumn::kNoRow, "its only line is its first");
static_assert(columnOf({-5, 10}).topOf(1) == -2 && columnOf({-5, 10}).rowAt(0) == 1);
static_assert(columnOf({INT32_MAX, INT32_MAX}, INT32_MAX).bottomOf(1) ==
              int64_t{3} * INT32_MAX + 3);

constexpr RowColumn withHidden() {
  RowColumn column(0, 1);
  column.add(10);
  column.addHidden();
  column.add(10);
  return column;
}
static_assert(withHidden().isHidden(1) && !withHidden().isHidden(0) && !withHidden().isHidden(2));
static_assert(withHidden().topOf(1) == 11 && withHidden().topOf(2) == 11);
static_assert(withHidden().rowAt(12) == 2 && withHidden().height() == 21);

constexpr RowColumn kTall = columnOf({97, 100});  // 200 high
static_assert(kTall.clampScroll(1, 150) == 0 && kTall.clampScroll(-20, 150) == -20);
static_assert(kTall.clampScroll(-50, 150) == -50 && kTall.clampScroll(-51, 150) == -50);
static_assert(kTall.clampScroll(-51, 200) == 0 && kTall.clampScroll(9, 999) == 0);
static_assert(kTall.clampScroll(INT32_MIN, INT32_MIN) == INT32_MIN);

constexpr RowColumn full() {
  RowColumn column(0, 0);
  while (column.count() < RowColumn::kMost) column.add(2);
  return column;
}
static_assert(full().rowAt(127) == 63 && full().height() == 128);

}  // namespace
