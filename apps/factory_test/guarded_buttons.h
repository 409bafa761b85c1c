/// Buttons that do not hear what was meant for the screen before.
#pragma once

#include <brimol/input.h>
#include <brimol/scene.h>

#include <array>
#include <cstddef>
#include <optional>

#include "current.h"
#include "press_guard.h"

namespace factory_test {

/// On the screen from their places to destruction. A click that a PressGuard lets through calls
/// choose(index) of the present Owner, on the dispatch thread. There is one set of an Owner at a
/// time, and its Owner is there before and after it.
template <typename Owner, typename Kind, std::size_t count>
class GuardedButtons {
 public:
  template <std::size_t index>
  void place(const SKIA_Rect& face, const SKIA_Text& caption) {
    guards.at(index) = PressGuard(GetTicks());
    Kind& button = buttons.at(index).emplace(&face, &caption);
    button.pressCallback = [](int) { Here::get().guards.at(index).press(GetTicks()); };
    button.clickCallback = [](int) {
      if (Here::get().guards.at(index).takeClick()) Current<Owner>::get().choose(index);
    };
    button.setActive(1);
  }

  /// Whether it is too early, for keys too.
  bool isDeaf() const { return guards.front().isDeaf(GetTicks()); }
  const SKIA_Rect& face(std::size_t index) { return *buttons.at(index)->getPositionAndSize(); }

 private:
  using Here = Current<GuardedButtons>;

  Here current{this};
  std::array<PressGuard, count> guards;
  std::array<std::optional<Kind>, count> buttons;
};

}  // namespace factory_test
