/// From what SDL reports of mouse, touch and keyboard to what the input is told.
#pragma once

#include <SDL_events.h>

#include "display/window_fit.h"
#include "input/input_translator.h"

namespace brimol::pc {

/// Passes on the left button, touches and keys; every other event is ignored, and so are a mouse's
/// touches and a touch's mouse that SDL makes up. `now` is when the event
/// happened, in the input's milliseconds: SDL has a clock of its own.
void passOn(const SDL_Event& event, const WindowFit& fit, uint32_t now, InputTranslator& input);

}  // namespace brimol::pc
