/// What one viewer holds down.
#pragma once

#include <SDL_keycode.h>

#include <cstdint>
#include <map>
#include <optional>
#include <set>

#include "remote/action_queue.h"

namespace brimol::pc {

/// What a finger does, as the page says it.
enum class FingerAction : uint8_t { Up = 0, Down = 1, Move = 2 };

/// The PC's key for an X key symbol, as VNC viewers send it; nothing where no phone's key and no
/// rule of the mouse asks for it.
std::optional<SDL_Keycode> keyOf(uint32_t symbol);

/// Turns what a viewer sends into actions, and lets go of everything when the viewer goes.
class ViewerHands {
 public:
  /// `viewer` tells its fingers from those of others. Actions go to `target`, which outlives this.
  ViewerHands(int64_t viewer, ActionQueue& target) : device(viewer), queue(target) {}

  /// `buttons` has bit 0 set while the left one is down.
  void mouse(int buttons, ScreenPoint at);
  /// An action that does not exist: nothing.
  void finger(FingerAction action, uint8_t number, ScreenPoint at);
  void key(uint32_t symbol, bool isDown);
  void letGo();

 private:
  int64_t device;
  ActionQueue& queue;
  std::map<int64_t, ScreenPoint> fingers;     // that are down, and where
  std::optional<ScreenPoint> mousePressedAt;  // or dragged to since
  std::set<SDL_Keycode> keys;
};

}  // namespace brimol::pc
