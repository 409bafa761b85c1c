/// Where the recorded frames go.
#pragma once

#include "scene/scene.h"

namespace brimol::pc {

/// Hands an ended frame to the platform's own thread, where it replaces one that still waits. Never
/// waits for painting. While the platform is closed the frame is dropped. Any thread.
void submitFrame(Frame&& frame);

}  // namespace brimol::pc
