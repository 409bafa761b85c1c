#include "input/keymap.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "input/long_press.h"

namespace brimol::pc {

namespace {

struct KeyRow {
  SDL_Keycode key;
  uint32_t code;           // what the phone's key reports
  std::string_view label;  // of the key on the PC
  std::string_view plays;  // the phone's key
};

// In the order of the help; a key that is not listed plays nothing.
constexpr auto kKeyTable = std::to_array<KeyRow>({
    {SDLK_UP, 273, "Up", "up"},
    {SDLK_DOWN, 274, "Down", "down"},
    {SDLK_RIGHT, 275, "Right", "right"},
    {SDLK_LEFT, 276, "Left", "left"},
    {SDLK_RETURN, 327, "Enter", "select"},
    {SDLK_KP_ENTER, 327, "Keypad Enter", "select"},
    {SDLK_h, 323, "H", "hook"},
    {SDLK_PAGEUP, 115, "Page Up", "volume up"},
    {SDLK_PAGEDOWN, 114, "Page Down", "volume down"},
    {SDLK_p, 116, "P", "power"},
    {SDLK_HOME, 102, "Home", "home"},
    {SDLK_ESCAPE, 158, "Escape", "back"},
    {SDLK_BACKSPACE, 158, "Backspace", "back"},
});

constexpr std::size_t kLabelColumns = 20;

std::string helpLine(std::string_view label, const std::string& meaning) {
  std::string line = "  ";
  line += label;
  line.append(kLabelColumns - std::min(label.size(), kLabelColumns - 1), ' ');
  return line + meaning + "\n";
}

std::string mouseHelp() {
  const std::string hold = std::to_string(LongPress::kHoldMs) + " ms";
  return helpLine("Left button", "the first finger; held still for " + hold + ": a long press") +
         helpLine("Shift", "held as the button is released: the finger stays down,") +
         helpLine("", "and the button plays the next one, until Shift is up") +
         helpLine("Touch", "every touch is a finger of its own");
}

}  // namespace

std::optional<uint32_t> phoneKey(SDL_Keycode key) {
  const auto* const row = std::ranges::find(kKeyTable, key, &KeyRow::key);
  if (row == kKeyTable.end()) return std::nullopt;
  return row->code;
}

std::optional<uint32_t> phoneKeyNamed(std::string_view name) {
  const auto isNamed = [name](const KeyRow& row) {
    const auto isSame = [](char written, char shown) {
      return written == shown || (written == '-' && shown == ' ');
    };
    return std::ranges::equal(name, row.plays, isSame);
  };
  const auto* const row = std::ranges::find_if(kKeyTable, isNamed);
  if (row == kKeyTable.end()) return std::nullopt;
  return row->code;
}

std::string helpText() {
  std::string text;
  for (const KeyRow& row : kKeyTable) {
    text += helpLine(row.label, std::string(row.plays) + " (" + std::to_string(row.code) + ")");
  }
  return text + mouseHelp();
}

}  // namespace brimol::pc
