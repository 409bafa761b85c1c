/// The painter: turns frames into pixels.
#pragma once

#include <cairo.h>

#include <memory>
#include <string>

#include "scene/geometry.h"
#include "scene/scene.h"

namespace brimol::pc {

/// Keeps one picture of the whole screen and repaints of it what a new frame changes.
/// One thread uses it.
class Painter {
 public:
  explicit Painter(Size screen);
  ~Painter();
  Painter(const Painter&) = delete;
  Painter& operator=(const Painter&) = delete;

  /// Makes `next` the picture shown and returns the pixels that were repainted, valid until the
  /// next call.
  const Region& paint(const Frame& next);

  /// What the picture shows, as it was given.
  const Frame& frame() const;

  /// The picture: CAIRO_FORMAT_RGB24 in the screen's size, owned by the painter, flushed.
  cairo_surface_t* picture() const;

 private:
  struct Parts;
  std::unique_ptr<Parts> parts;
};

}  // namespace brimol::pc
