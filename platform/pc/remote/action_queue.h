/// What viewers did, on its way to the platform's thread.
#pragma once

#include <SDL_keycode.h>

#include <condition_variable>
#include <cstdint>
#include <mutex>
#include <optional>
#include <vector>

#include "input/input_translator.h"

namespace brimol::pc {

struct ViewerAction {
  enum class Kind { PointerDown, PointerMove, PointerUp, KeyDown, KeyUp };
  Kind kind;
  PointerId pointer = {};  // of a pointer's
  ScreenPoint at = {};
  SDL_Keycode key = SDLK_UNKNOWN;  // of a key's

  friend bool operator==(const ViewerAction&, const ViewerAction&) = default;
};

/// Tells the input what a viewer did.
void play(const ViewerAction& action, uint32_t now, InputTranslator& input);

/// The actions that wait, in their order. Any thread may call any operation.
class ActionQueue {
 public:
  /// Who adds should stop at this many: more would follow faster than they are played.
  static constexpr std::size_t kEnough = 1024;

  void push(const ViewerAction& action);
  bool isFull();
  /// Sleeps until an action waits, wake() was called, or `ms` milliseconds have passed, where they
  /// are given; returns what waits.
  std::vector<ViewerAction> wait(std::optional<uint32_t> ms);
  void wake();

 private:
  std::mutex mutex;  // guards all
  std::condition_variable changed;
  std::vector<ViewerAction> actions;
  bool isWoken = false;
};

}  // namespace brimol::pc
