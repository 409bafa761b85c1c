#include "lists/row_column.h"

#include <initializer_list>

// Checked where they are compiled: where rows stand, and the scroll.

namespace {

using MW::RowColumn;

constexpr RowColumn columnOf(std::initializer_list<int> heights, int64_t top = 0) {
  RowColumn column(top, 3);
  for (const int height : heights) column.add(height);
  return column;
}

constexpr RowColumn kRows = columnOf({100, 0, -5, 50}, 340);  // 340 to 440, 443, 446, 444 to 494
static_assert(kRows.nextTop() == 497 && kRows.height() == 154 && columnOf({}).height() == -3);
static_assert(columnOf({INT32_MAX, INT32_MAX}, INT32_MAX).nextTop() == int64_t{3} * INT32_MAX + 6);

constexpr RowColumn kTall = columnOf({97, 100});  // 200 high
static_assert(kTall.clampScroll(1, 150) == 0 && kTall.clampScroll(-50, 150) == -50);
static_assert(kTall.clampScroll(-51, 150) == -50 && kTall.clampScroll(-51, 200) == 0);
static_assert(kTall.clampScroll(INT32_MIN, INT32_MIN) == INT32_MIN);

}  // namespace
