#include "core/life_turn.h"

#include <atomic>

#include "core/layer_walk.h"

namespace MW {

namespace {

enum class State { Free, Taken, EndAsked };  // the end is asked of the thread that has taken it

// One word, so that no request falls between its owner's last look and the turn's end.
constinit std::atomic<State> state = State::Free;

bool take() {
  State seen = State::Free;
  return state.compare_exchange_strong(seen, State::Taken);
}

bool waitAndTake() {
  while (!take()) {
    const State seen = state;
    if (seen != State::Free) state.wait(seen);
  }
  return true;
}

bool takeOrAsk() {
  State seen = state;
  while (!state.compare_exchange_weak(seen, seen == State::Free ? State::Taken : State::EndAsked)) {
  }
  return seen == State::Free;
}

bool begin(LifeTurn::For what) {
  if (!LayerWalk::isOnThisThread()) return waitAndTake();
  return what == LifeTurn::For::Start ? take() : takeOrAsk();
}

}  // namespace

LifeTurn::LifeTurn(For what) : mine(begin(what)) {}

LifeTurn::~LifeTurn() {
  if (!mine) return;
  state = State::Free;
  state.notify_all();
}

bool LifeTurn::giveBack() {
  State seen = State::Taken;
  if (!state.compare_exchange_strong(seen, State::Free)) return false;
  mine = false;
  state.notify_all();
  return true;
}

}  // namespace MW
