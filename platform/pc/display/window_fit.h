/// Where the screen's picture stands in a window, and which screen pixel a window position means.
#pragma once

#include <cairo.h>

#include "input/event_records.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// A position in window pixels.
struct WindowPoint {
  int x;
  int y;
};

/// The largest picture of `screen` that fits into `area`, whose sides are at least 1, in the same
/// proportions, at least one pixel each way. What is not whole is rounded down.
Size fittedSize(Size screen, Size area);

/// The screen's picture, scaled to fit a window and centred in it.
struct WindowFit {
  Size screen;
  Size window;
  cairo_rectangle_int_t shown;  // the picture's place, in window pixels

  /// Window sides below 1 count as 1. A window of a fitted size is filled.
  static WindowFit of(Size screen, Size window);

  /// The screen pixel that a window position means, on the screen for every position. The
  /// picture's outermost pixels mean the screen's outermost, and those between are spread evenly,
  /// rounded to the nearest; at full size each pixel means itself. A position beside the picture
  /// means the nearest pixel at its edge.
  ScreenPoint toScreen(WindowPoint position) const;

  /// The window pixels that cover any of the screen's `pixels`.
  cairo_rectangle_int_t toWindow(const cairo_rectangle_int_t& pixels) const;
};

}  // namespace brimol::pc
