#include "input_watch.h"

#include <brimol/input.h>

#include <utility>

namespace factory_test {

using Watch = Current<InputWatch>;

InputWatch::InputWatch() {
  using enum Input::Kind;
  touch.emplace();
  touch->pressCallback = [](MW::mouse_event* mouse) { Watch::get().add(Press, *mouse); };
  touch->hoverCallback = [](MW::mouse_event* mouse) { Watch::get().add(Move, *mouse); };
  touch->clickCallback = [](MW::mouse_event* mouse) { Watch::get().add(Lift, *mouse); };
  touch->setActive(1);
  key.emplace();
  key->keyPressCallback = [](MW::kbd_event* event) { Watch::get().add(KeyPress, *event); };
  key->keyReleaseCallback = [](MW::kbd_event* event) { Watch::get().add(KeyRelease, *event); };
}

std::vector<Input> InputWatch::take() {
  const std::lock_guard lock(mutex);
  return std::exchange(inputs, {});
}

void InputWatch::add(Input::Kind kind, const MW::mouse_event& mouse) {
  add({kind, GetTicks(), mouse.finger, mouse.x, mouse.y, 0});
}

void InputWatch::add(Input::Kind kind, const MW::kbd_event& event) {
  add({kind, GetTicks(), 0, 0, 0, event.code});
}

void InputWatch::add(const Input& input) {
  const std::lock_guard lock(mutex);
  inputs.push_back(input);
}

}  // namespace factory_test
