/// Sizes and pixel rectangles that the parts of the PC platform exchange.
#pragma once

#include <cairo.h>

#include <vector>

namespace brimol::pc {

struct Size {
  int w;
  int h;
  friend bool operator==(const Size&, const Size&) = default;
};

/// Disjoint rectangles within the screen, in screen pixels; empty: nothing.
using Region = std::vector<cairo_rectangle_int_t>;

}  // namespace brimol::pc
