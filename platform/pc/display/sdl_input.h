/// From what SDL reports of mouse, touch and keyboard to what the input is told.
#pragma once

#include <SDL_events.h>

#include "display/window_fit.h"
#include "input/input_translator.h"

namespace brimol::pc {

/// Passes on the left button, touches and keys. All other events are ignored, and so are the
/// touches that SDL derives from a mouse and the mouse events that it derives from touches. `now`
/// is when the event happened, in the input's milliseconds: SDL's clock is another one.
void passOn(const SDL_Event& event, const WindowFit& fit, uint32_t now, InputTranslator& input);

}  // namespace brimol::pc
