/// Where the rows of a scrolling list stand.
#pragma once

#include <algorithm>
#include <array>
#include <cstdint>

#include "core/hit_test.h"

namespace MW {

/// Rows one below the other, each with a gap behind it. Drawing, hit test, keys and scrolling of a
/// list ask the same column. Places are pixels on the screen, wider than a record's words, so that
/// no sum overflows.
class RowColumn {
 public:
  static constexpr int kMost = 64;
  static constexpr int kNoRow = -1;

  constexpr RowColumn(int64_t firstTop, int rowGap) : tops{firstTop}, gap(rowGap) {}

  /// Appends a row. There are kMost at most.
  constexpr void add(int height) { append(int64_t{height} + gap); }
  /// Appends a row that takes no room and is never met.
  constexpr void addHidden() { append(0); }

  constexpr int count() const { return rows; }
  /// Of row count(): where the next one would begin.
  constexpr int64_t topOf(int row) const { return tops[static_cast<std::size_t>(row)]; }
  constexpr int64_t bottomOf(int row) const { return topOf(row + 1) - gap; }
  constexpr bool isHidden(int row) const { return topOf(row) == topOf(row + 1); }
  /// Of all rows with the gaps between them: without a row a gap less than nothing.
  constexpr int64_t height() const { return topOf(rows) - topOf(0) - gap; }

  /// The row at a height, or kNoRow. A row's first line of pixels belongs to none.
  constexpr int rowAt(int64_t y) const {
    int row = 0;
    while (row < rows && !isBetween(topOf(row), y, bottomOf(row))) ++row;
    return row < rows ? row : kNoRow;
  }

  /// The nearest scroll to the wanted one in a view of such a height: 0 shows the column's head, a
  /// negative one what lies further down, its foot at most.
  constexpr int64_t clampScroll(int64_t wanted, int64_t viewHeight) const {
    return std::min(std::max(wanted, viewHeight - height()), int64_t{0});
  }

 private:
  constexpr void append(int64_t room) {
    const int64_t next = topOf(rows) + room;
    tops[static_cast<std::size_t>(++rows)] = next;
  }

  std::array<int64_t, kMost + 1> tops;
  int rows = 0;
  int gap;
};

}  // namespace MW
