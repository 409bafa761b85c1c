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

/// The texts of those that have a size, each with "|" behind it.
inline std::string words(const std::vector<Drawing>& drawings) {
  std::string all;
  for (const Drawing& each : drawings) all += each.text.size == 0 ? "" : each.text.text + '|';
  return all;
}

}  // namespace brimol::test
