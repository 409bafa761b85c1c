/// Owners of cairo's reference-counted objects.
#pragma once

#include <cairo.h>

#include <memory>

namespace brimol::pc {

struct CairoDeleter {
  void operator()(cairo_t* context) const { cairo_destroy(context); }
  void operator()(cairo_surface_t* surface) const { cairo_surface_destroy(surface); }
  void operator()(cairo_region_t* region) const { cairo_region_destroy(region); }
};

using CairoContext = std::unique_ptr<cairo_t, CairoDeleter>;
using CairoSurface = std::unique_ptr<cairo_surface_t, CairoDeleter>;
using CairoRegion = std::unique_ptr<cairo_region_t, CairoDeleter>;

}  // namespace brimol::pc
