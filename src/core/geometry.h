/// Integer geometry that cannot overflow.
#pragma once

#include <brimol/scene.h>

#include <algorithm>
#include <cstdint>
#include <limits>

namespace MW {

struct ScreenSize {
  int w;
  int h;
};

/// The nearest number of pixels that a record's word can hold.
constexpr int32_t toPixels(int64_t value) {
  constexpr int64_t kLowest = std::numeric_limits<int32_t>::min();
  constexpr int64_t kHighest = std::numeric_limits<int32_t>::max();
  return static_cast<int32_t>(std::clamp(value, kLowest, kHighest));
}

/// Truncates toward zero; what an int cannot hold becomes its limit, what is no number 0.
constexpr int truncated(double value) {
  constexpr double kLowest = std::numeric_limits<int>::min();
  constexpr double kHighest = std::numeric_limits<int>::max();
  const bool isNumber = value == value;
  return isNumber ? static_cast<int>(std::clamp(value, kLowest, kHighest)) : 0;
}
static_assert(truncated(-1.9) == -1 && truncated(1e10) == std::numeric_limits<int>::max());

constexpr SKIA_Rect makeRect(int64_t x, int64_t y, int64_t w, int64_t h, uint32_t color) {
  return {toPixels(x), toPixels(y), toPixels(w), toPixels(h), color};
}

/// A null rectangle is all zero.
constexpr SKIA_Rect copyRect(const SKIA_Rect* given) {
  return given != nullptr ? *given : SKIA_Rect{};
}

/// Truncates toward zero.
constexpr int64_t percentOf(int64_t length, int percent) {
  constexpr int kWhole = 100;
  return length * percent / kWhole;
}
static_assert(percentOf(199, 50) == 99 && percentOf(-199, 50) == -99);

/// The rectangle that lies `by` pixels further out on every side.
constexpr SKIA_Rect grown(const SKIA_Rect& area, int by, uint32_t color) {
  return makeRect(int64_t{area.x} - by, int64_t{area.y} - by, int64_t{area.w} + int64_t{2} * by,
                  int64_t{area.h} + int64_t{2} * by, color);
}

/// Everything, and one pixel more to the right and below.
constexpr SKIA_Rect overScreen(ScreenSize screen, uint32_t color) {
  return makeRect(0, 0, int64_t{screen.w} + 1, int64_t{screen.h} + 1, color);
}

}  // namespace MW
