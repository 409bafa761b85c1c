/// The scene: one frame's display items, and what differs between two frames.
#pragma once

#include <brimol/scene.h>

#include <vector>

#include "scene/geometry.h"

namespace brimol::pc {

/// The display items of one picture, in drawing order.
using Frame = std::vector<SKIA_Item>;

/// The pixels that may differ between the picture of `shown` and that of `next`, within `screen`.
Region changedRegion(const Frame& shown, const Frame& next, Size screen);

}  // namespace brimol::pc
