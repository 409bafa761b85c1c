/// The pixels of a window that shows the screen's picture.
#pragma once

#include "display/scaler.h"
#include "display/window_fit.h"
#include "scene/cairo_handles.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// A window's content: the picture, scaled to fit, on black. One thread uses it.
class WindowCanvas {
 public:
  /// Black, of the window's size; window sides below 1 count as 1.
  WindowCanvas(Size screen, Size window);

  /// Takes over the changed screen pixels of `picture` and returns the window pixels that may
  /// differ now. However a picture came here, by parts or at once, the content is the same.
  Region update(cairo_surface_t* picture, const Region& changed);

  /// The content: CAIRO_FORMAT_RGB24 in the window's size, owned by the canvas, flushed.
  cairo_surface_t* pixels() const { return content.get(); }

  const WindowFit& fit() const { return placement; }

 private:
  WindowFit placement;
  Scaler scaler;
  CairoSurface content;
};

}  // namespace brimol::pc
