/// Pictures of the screen's size.
#pragma once

#include "scene/cairo_handles.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// CAIRO_FORMAT_RGB24, black. Where there is no memory, cairo's picture of no size that says so.
CairoSurface newPicture(Size size);

}  // namespace brimol::pc
