/// Points and rectangles.
#pragma once

#include <MW/records.h>
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

/// Whether it lies between two edges that are both outside.
constexpr bool isBetween(int64_t low, int64_t value, int64_t high) {
  return low < value && value < high;
}

/// All four edges are outside.
constexpr bool containsInside(const SKIA_Rect& area, Position point) {
  return isBetween(area.x, point.x, int64_t{area.x} + area.w) &&
         isBetween(area.y, point.y, int64_t{area.y} + area.h);
}
static_assert(containsInside({10, 20, 5, 5, 0}, {11, 24}));
static_assert(!containsInside({10, 20, 5, 5, 0}, {10, 21}) &&
              !containsInside({10, 20, 5, 5, 0}, {11, 20}));

constexpr Position positionOf(const mouse_event& mouse) { return {mouse.x, mouse.y}; }
constexpr Position positionOf(const event_data& event) { return positionOf(event.mouse); }

/// Whether its `mouse` record is the one that is set.
constexpr bool isPointerEvent(const event_data& event) {
  return event.type >= kEventMotion && event.type <= kEventLongPress;
}

}  // namespace MW
