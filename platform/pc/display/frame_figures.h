/// What is known of a painted frame.
#pragma once

#include <chrono>
#include <optional>

#include "scene/geometry.h"
#include "scene/scene.h"

namespace brimol::pc {

struct FrameFigures {
  const Frame& items;     // stays as it is until the next frame is painted
  const Region& changed;  // what was repainted
  std::chrono::microseconds painting;
  /// From the first input record since the frame before to the end of the painting; none where
  /// there was no record.
  std::optional<std::chrono::microseconds> sinceInput;
};

}  // namespace brimol::pc
