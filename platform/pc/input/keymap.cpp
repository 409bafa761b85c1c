#include "input/keymap.h"

#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <string_view>

#include "input/long_press.h"

namespace brimol::pc {

namespace {

struct KeyRow {
  SDL_Keycode key;
  BrimolKeyCode code;      // what the phone's key reports
  std::string_view label;  // of the key on the PC
  std::string_view plays;  // the phone's key
};

// In the order of the help; a key that is not listed plays nothing.
constexpr auto kKeyTable = std::to_array<KeyRow>({
    {SDLK_UP, BRIMOL_CODE_UP, "Up", "up"},
    {SDLK_DOWN, BRIMOL_CODE_DOWN, "Down", "down"},
    {SDLK_RIGHT, BRIMOL_CODE_RIGHT, "Right", "right"},
    {SDLK_LEFT, BRIMOL_CODE_LEFT, "Left", "left"},
    {SDLK_RETURN, BRIMOL_CODE_SELECT, "Enter", "select"},
    {SDLK_KP_ENTER, BRIMOL_CODE_SELECT, "Keypad Enter", "select"},
    {SDLK_h, BRIMOL_CODE_HOOK, "H", "hook"},
    {SDLK_PAGEUP, BRIMOL_CODE_VOLUME_UP, "Page Up", "volume up"},
    {SDLK_PAGEDOWN, BRIMOL_CODE_VOLUME_DOWN, "Page Down", "volume down"},
    {SDLK_p, BRIMOL_CODE_POWER, "P", "power"},
    {SDLK_HOME, BRIMOL_CODE_HOME, "Home", "home"},
    {SDLK_ESCAPE, BRIMOL_CODE_BACK, "Escape", "back"},
    {SDLK_BACKSPACE, BRIMOL_CODE_BACK, "Backspace", "back"},
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
