/// Points and rectangles.
#pragma once

#include <brimol/scene.h>

#include <cstdint>

namespace MW {

struct Position {
  int64_t x;  // wider than a record's words, so that no sum overflows
  int64_t y;
};

/// Left and top edges are inside, right and bottom edges outside.
constexpr bool contains(const SKIA_Rect& area, Position point) {
  return area.x <= point.x && point.x < int64_t{area.x} + area.w && area.y <= point.y &&
         point.y < int64_t{area.y} + area.h;
}
static_assert(contains({10, 20, 5, 5, 0}, {10, 20}));
static_assert(!contains({10, 20, 5, 5, 0}, {15, 24}) && !contains({10, 20, 5, 5, 0}, {14, 25}));

}  // namespace MW
