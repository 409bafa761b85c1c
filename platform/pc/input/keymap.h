/// Which key of a PC plays which key of the phone.
#pragma once

#include <SDL_keycode.h>

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace brimol::pc {

/// The phone's code for a key of the PC; none where the key plays nothing.
std::optional<uint32_t> phoneKey(SDL_Keycode key);

/// The code of the phone's key of that name, as traces write it: "select", "volume-up"; none for
/// any other text.
std::optional<uint32_t> phoneKeyNamed(std::string_view name);

/// The keys and the rules of the mouse, a line each, every line with its line end.
std::string helpText();

}  // namespace brimol::pc
