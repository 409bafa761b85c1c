/// Which key of a PC plays which key of the phone.
#pragma once

#include <SDL_keycode.h>

#include <cstdint>
#include <optional>
#include <string>

namespace brimol::pc {

/// The phone's code for a key of the PC; none where the key plays nothing.
std::optional<uint32_t> phoneKey(SDL_Keycode key);

/// The keys and the rules of the mouse, a line each, every line with its line end.
std::string helpText();

}  // namespace brimol::pc
