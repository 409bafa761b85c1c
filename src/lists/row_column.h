/// Where the rows of a scrolling list stand.
#pragma once

#include <algorithm>
#include <cstdint>

#include "core/hit_test.h"

namespace MW {

/// Places are pixels on the screen, wider than a record's words, so that no sum overflows.
struct RowPlace {
  int64_t top, bottom;

  /// Whether a height lies on the row, whose first line of pixels belongs to none.
  constexpr bool isAt(int64_t y) const { return isBetween(top, y, bottom); }
};

/// Rows one below the other, each with a gap behind it. Drawing, hit test, keys and scrolling of a
/// list all go down such a column.
class RowColumn {
 public:
  constexpr RowColumn(int64_t firstTop, int rowGap)
      : first(firstTop), next(firstTop), gap(rowGap) {}

  /// Appends a row. Where it stands.
  constexpr RowPlace add(int height) {
    const RowPlace row = {next, next + height};
    next = row.bottom + gap;
    return row;
  }
  /// Where the next row begins.
  constexpr int64_t nextTop() const { return next; }
  /// All rows and the gaps between them; minus one gap if there are none.
  constexpr int64_t height() const { return next - first - gap; }

  /// The nearest scroll to the wanted one in a view of such a height: 0 shows the column's head, a
  /// negative one what lies further down, its foot at most.
  constexpr int64_t clampScroll(int64_t wanted, int64_t viewHeight) const {
    return std::min(std::max(wanted, viewHeight - height()), int64_t{0});
  }

 private:
  int64_t first;
  int64_t next;
  int gap;
};

}  // namespace MW
