/// What tests expect of drawing, short enough for tables, and the screens that they draw on.
#pragma once

#include <MW/window.h>

#include <algorithm>
#include <array>
#include <climits>
#include <sstream>

#include <brimol3_widget_test/input.h>

namespace brimol::test {

/// Tells the toolkit the screen's size, in pixels.
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

/// What those say that take a text, each with a "|" behind it and a red one with a "!" before it.
inline std::string words(const std::vector<Drawing>& drawings) {
  constexpr uint32_t kRed = 0xFFFF0000;
  constexpr std::array kWordless = {Call::Box, Call::RoundBox, Call::Line, Call::Arrow};
  std::string all;
  for (const Drawing& each : drawings) {
    if (std::ranges::count(kWordless, each.call) == 0)
      all += (each.text.color == kRed ? "!" : "") + each.text.text + '|';
  }
  return all;
}

/// Where the last one stands that says `text`. There is one.
inline SKIA_Rect placeOf(const std::vector<Drawing>& drawings, const std::string& text) {
  const auto saysIt = [&](const Drawing& each) { return each.text.text == text; };
  return std::find_if(drawings.rbegin(), drawings.rend(), saysIt)->rect;
}

}  // namespace brimol::test
