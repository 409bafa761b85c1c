#include "remote/action_queue.h"

#include <chrono>
#include <utility>

namespace brimol::pc {

void play(const ViewerAction& action, uint32_t now, InputTranslator& input) {
  switch (action.kind) {
    case ViewerAction::Kind::PointerDown: return input.pointerDown(action.pointer, action.at, now);
    case ViewerAction::Kind::PointerMove: return input.pointerMove(action.pointer, action.at, now);
    case ViewerAction::Kind::PointerUp: return input.pointerUp(action.pointer, action.at, now);
    case ViewerAction::Kind::KeyDown: return input.keyDown(action.key);
    case ViewerAction::Kind::KeyUp: return input.keyUp(action.key);
  }
}

void ActionQueue::push(const ViewerAction& action) {
  {
    const std::lock_guard lock(mutex);
    actions.push_back(action);
  }
  changed.notify_one();
}

bool ActionQueue::isFull() {
  const std::lock_guard lock(mutex);
  return actions.size() >= kEnough;
}

std::vector<ViewerAction> ActionQueue::wait(std::optional<uint32_t> ms) {
  std::unique_lock lock(mutex);
  const auto isOver = [this] { return isWoken || !actions.empty(); };
  if (ms) {
    changed.wait_for(lock, std::chrono::milliseconds(*ms), isOver);
  } else {
    changed.wait(lock, isOver);
  }
  isWoken = false;
  return std::exchange(actions, {});
}

void ActionQueue::wake() {
  {
    const std::lock_guard lock(mutex);
    isWoken = true;
  }
  changed.notify_one();
}

}  // namespace brimol::pc
