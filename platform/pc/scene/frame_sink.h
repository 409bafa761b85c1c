/// Where the recorded frames go.
#pragma once

#include "scene/scene.h"

namespace brimol::pc {

/// Hands an ended frame to the platform's own thread, where it replaces one that still waits. Never
/// waits for painting. While the platform is closed nothing happens. Afterwards `frame` holds any
/// items, and memory for the next one's. Any thread.
void submitFrame(Frame& frame);

}  // namespace brimol::pc
