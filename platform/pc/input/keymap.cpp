#include "input/keymap.h"

#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <string_view>
#include <utility>

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

struct DisplayKeyRow {
  SDL_Keycode key;
  DisplayKey means;
  std::string_view label;
  std::string_view does;
};

// In the order of the help. None is a key of the phone.
constexpr auto kDisplayKeys = std::to_array<DisplayKeyRow>({
    {SDLK_F1, DisplayKey::ListKeys, "F1", "list the keys, or hide the list"},
    {SDLK_F10, DisplayKey::ShowFigures, "F10", "show what was repainted and how fast, or hide it"},
    {SDLK_F11, DisplayKey::FullScreen, "F11", "full screen, or a window again"},
    {SDLK_F12, DisplayKey::SavePicture, "F12", "save a picture in the working directory"},
});

constexpr std::size_t kLabelColumns = 20;
constexpr std::size_t kMeaningColumns = 56;

// In lines of kMeaningColumns, where its words allow it.
std::string helpLines(const HelpRow& row) {
  std::string lines;
  std::string_view rest = row.meaning;
  for (std::string_view label = row.label; !rest.empty(); label = {}) {
    std::size_t end = rest.size();
    if (end > kMeaningColumns) end = std::min(rest.rfind(' ', kMeaningColumns), end);
    lines.append("  ").append(label).append(kLabelColumns - label.size(), ' ');
    lines.append(rest.substr(0, end)).append("\n");
    rest.remove_prefix(std::min(end + 1, rest.size()));
  }
  return lines;
}

std::vector<HelpRow> mouseRows() {
  const std::string hold = std::to_string(LongPress::kHoldMs) + " ms";
  return {{"Left button", "the first finger; held still for " + hold + ": a long press"},
          {"Shift",
           "held as the button is released: the finger stays down, and the button plays the next "
           "one, until Shift is up"},
          {"Ctrl",
           "held as the button is pressed: a second finger, opposite the mouse as seen from where "
           "it was when Ctrl went down"},
          {"Wheel", "a finger that drags from where the mouse is"},
          {"Touch", "every touch is a finger of its own"}};
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

std::optional<DisplayKey> displayKey(SDL_Keycode key) {
  const auto* const row = std::ranges::find(kDisplayKeys, key, &DisplayKeyRow::key);
  if (row == kDisplayKeys.end()) return std::nullopt;
  return row->means;
}

std::vector<HelpRow> helpRows() {
  constexpr std::size_t kMouseRowsAndGaps = 8;
  std::vector<HelpRow> rows;
  rows.reserve(kKeyTable.size() + kDisplayKeys.size() + kMouseRowsAndGaps);
  for (const KeyRow& row : kKeyTable) {
    rows.push_back({row.label, std::string(row.plays) + " (" + std::to_string(row.code) + ")"});
  }
  rows.push_back({});
  for (HelpRow& row : mouseRows()) rows.push_back(std::move(row));
  rows.push_back({});
  for (const DisplayKeyRow& row : kDisplayKeys) rows.push_back({row.label, std::string(row.does)});
  return rows;
}

std::string helpText() {
  std::string text;
  for (const HelpRow& row : helpRows()) text += helpLines(row);
  return text;
}

}  // namespace brimol::pc
