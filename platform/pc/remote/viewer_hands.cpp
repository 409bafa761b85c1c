#include "remote/viewer_hands.h"

#include <rfb/keysym.h>

#include <algorithm>
#include <array>
#include <utility>

namespace brimol::pc {
namespace {

using Kind = ViewerAction::Kind;

struct SymbolRow {
  uint32_t symbol;
  SDL_Keycode key;
};

// Keys without a character; those with one have its number, in lower case, in both worlds.
constexpr auto kSymbols = std::to_array<SymbolRow>({
    {XK_Up, SDLK_UP},
    {XK_Down, SDLK_DOWN},
    {XK_Right, SDLK_RIGHT},
    {XK_Left, SDLK_LEFT},
    {XK_Return, SDLK_RETURN},
    {XK_KP_Enter, SDLK_KP_ENTER},
    {XK_Page_Up, SDLK_PAGEUP},
    {XK_Page_Down, SDLK_PAGEDOWN},
    {XK_Home, SDLK_HOME},
    {XK_Escape, SDLK_ESCAPE},
    {XK_BackSpace, SDLK_BACKSPACE},
    {XK_Shift_L, SDLK_LSHIFT},
    {XK_Shift_R, SDLK_RSHIFT},
});

constexpr int kLeftButton = 1;

}  // namespace

std::optional<SDL_Keycode> keyOf(uint32_t symbol) {
  if (symbol >= XK_A && symbol <= XK_Z) symbol += XK_a - XK_A;
  if (symbol >= XK_a && symbol <= XK_z) return static_cast<SDL_Keycode>(symbol);
  const auto* const row = std::ranges::find(kSymbols, symbol, &SymbolRow::symbol);
  if (row == kSymbols.end()) return std::nullopt;
  return row->key;
}

void ViewerHands::mouse(int buttons, ScreenPoint at) {
  const bool isDown = (buttons & kLeftButton) != 0;
  if (!isDown && !mousePressedAt) return;
  if (isDown) {
    queue.push({mousePressedAt ? Kind::PointerMove : Kind::PointerDown, kMouse, at});
    mousePressedAt = at;
  } else {
    queue.push({Kind::PointerUp, kMouse, at});
    mousePressedAt.reset();
  }
}

void ViewerHands::finger(FingerAction action, uint8_t number, ScreenPoint at) {
  const PointerId pointer = {device, number};
  switch (action) {
    case FingerAction::Down: queue.push({Kind::PointerDown, pointer, at}); break;
    case FingerAction::Move: queue.push({Kind::PointerMove, pointer, at}); break;
    case FingerAction::Up: queue.push({Kind::PointerUp, pointer, at}); break;
    default: return;
  }
  if (action == FingerAction::Up) {
    fingers.erase(number);
  } else {
    fingers[number] = at;
  }
}

void ViewerHands::key(uint32_t symbol, bool isDown) {
  const std::optional<SDL_Keycode> known = keyOf(symbol);
  if (!known) return;
  queue.push({isDown ? Kind::KeyDown : Kind::KeyUp, {}, {}, *known});
  if (isDown) {
    keys.insert(*known);
  } else {
    keys.erase(*known);
  }
}

// The keys first: a Shift key that is down would pin the mouse's finger.
void ViewerHands::letGo() {
  for (const SDL_Keycode key : std::exchange(keys, {})) queue.push({Kind::KeyUp, {}, {}, key});
  for (const auto& [number, at] : std::exchange(fingers, {})) {
    queue.push({Kind::PointerUp, {device, number}, at});
  }
  if (mousePressedAt) mouse(0, *mousePressedAt);
}

}  // namespace brimol::pc
