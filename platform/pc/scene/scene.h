/// The scene: one frame's display items, and what differs between two frames.
#pragma once

#include <brimol/scene.h>

#include <vector>

#include "scene/geometry.h"

namespace brimol::pc {

/// The display items of one picture, in drawing order.
using Frame = std::vector<SKIA_Item>;

/// Tells what differs between frames. Its memory is kept for the next ones. One thread uses it.
class Changes {
 public:
  explicit Changes(Size size) : screen(size) {}

  /// The pixels that may differ between the picture of `shown` and that of `next`, within the
  /// screen. Valid until the next call.
  const Region& between(const Frame& shown, const Frame& next);

 private:
  void collect(const Frame& shown, const Frame& next);
  void add(const SKIA_Item& item);
  void merge();

  Size screen;
  cairo_rectangle_int_t around = {};  // all pieces
  Region pieces;                      // the bounds of changed items
  Region merged;
};

}  // namespace brimol::pc
