/// The scene: one frame's display items, and what differs between two frames.
#pragma once

#include <brimol/scene.h>

#include <functional>
#include <utility>
#include <vector>

#include "scene/rectangles.h"

namespace brimol::pc {

/// The display items of one picture, in drawing order.
using Frame = std::vector<SKIA_Item>;

/// Tells what differs between frames. Its memory is kept for the next ones. One thread uses it.
class Changes {
 public:
  /// What an item's text touches of the item's bounds, which only those who draw it know.
  using TextArea = std::function<Pixels(const SKIA_Item& item, const Pixels& bounds)>;

  explicit Changes(Size size, TextArea areaOf = boundsAlone)
      : screen(size), textArea(std::move(areaOf)) {}

  /// The pixels that may differ between the picture of `shown` and that of `next`, within the
  /// screen. Valid until the next call.
  const Region& between(const Frame& shown, const Frame& next);

 private:
  static Pixels boundsAlone(const SKIA_Item&, const Pixels& bounds) { return bounds; }
  void collect(const Frame& shown, const Frame& next);
  void addTexts(const SKIA_Item& older, const SKIA_Item& newer);
  void add(const Pixels& area);
  void merge();

  Size screen;
  TextArea textArea;
  Pixels around = {};  // all pieces
  Region pieces;       // the bounds of changed items
  Region merged;
};

}  // namespace brimol::pc
