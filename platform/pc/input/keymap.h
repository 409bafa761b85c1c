/// Which key of a PC plays which key of the phone.
#pragma once

#include <SDL_keycode.h>

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brimol::pc {

/// The phone's code for a key of the PC; none where the key plays nothing.
std::optional<uint32_t> phoneKey(SDL_Keycode key);

/// The code of the phone's key of that name, as traces write it: "select", "volume-up"; none for
/// any other text.
std::optional<uint32_t> phoneKeyNamed(std::string_view name);

/// What a key does to the display and not to the phone.
enum class DisplayKey { ListKeys, ShowFigures, FullScreen, SavePicture };

/// None where the key is none of the display's.
std::optional<DisplayKey> displayKey(SDL_Keycode key);

/// A key or a way to use the mouse, and what it does.
struct HelpRow {
  std::string_view label;
  std::string meaning;
};

/// The phone's keys, the rules of the mouse, and the display's keys, in this order, with a row
/// without words between them.
std::vector<HelpRow> helpRows();

/// The same as lines, every line with its line end.
std::string helpText();

}  // namespace brimol::pc
