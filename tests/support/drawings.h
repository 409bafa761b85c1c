/// What tests expect of drawing, short enough for tables, and the screens that they draw on.
#pragma once

#include <MW/window.h>

#include <climits>
#include <sstream>

#include "support/widget_test.h"

namespace brimol::test {

inline void setScreen(int w, int h) {
  MW::Window::width = w;
  MW::Window::height = h;
}

/// Where they stand, each as "x,y wxh|".
inline std::string places(const std::vector<Drawing>& drawings) {
  std::ostringstream all;
  for (const Drawing& each : drawings) {
    const auto& [x, y, w, h, color] = each.rect;
    all << x << ',' << y << ' ' << w << 'x' << h << '|';
  }
  return all.str();
}

/// Screens that no machine has: 0 is the default size, the others are taken as they are.
inline constexpr auto kHostileSizes = {0, 1, 7, -1, -1080, INT_MIN, INT_MAX};

/// A record without a NUL.
inline SKIA_Text endlessText(char byte) {
  SKIA_Text record = {};
  for (char& each : record.text) each = byte;
  record.string_len = record.size = INT_MAX;
  return record;
}

}  // namespace brimol::test
