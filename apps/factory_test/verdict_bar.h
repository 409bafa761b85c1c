/// The verdicts of a test's screen, and the way out.
#pragma once

#include <MW/button.h>
#include <MW/key.h>
#include <brimol/input.h>

#include <array>
#include <atomic>
#include <cstdint>
#include <optional>

#include "current.h"
#include "guarded_buttons.h"
#include "test.h"
#include "veil.h"

namespace factory_test {

/// PASS, RETRY, FAIL, and Leave in the title's bar. Fingers press them. Of keys left and right move
/// between the verdicts, select takes one, back leaves the test. Neither does anything at first
/// (PressGuard), when a veil lies over the verdicts. They are on the screen from construction to
/// destruction; there is one bar at a time.
class VerdictBar {
 public:
  /// What keys do: Choose as above; Free where the test itself wants them all.
  enum class Keys { Choose, Free };

  explicit VerdictBar(Keys keys = Keys::Choose);

  /// Called on the dispatch thread with the code of every other key that is pressed. Null: not
  /// called.
  void (*otherKey)(unsigned int code) = nullptr;

  /// Draws the mark of the chosen button, which stands under the buttons.
  void draw();
  /// What was chosen. Any thread.
  Outcome outcome() const { return chosen; }
  /// Nothing was chosen. Any thread.
  void takeBack() { chosen = Outcome::Running; }

 private:
  static constexpr std::size_t kButtons = 4;
  static constexpr int kVerdicts = 3;  // the first of them

  using Buttons = GuardedButtons<VerdictBar, MW::Button, kButtons>;
  friend Buttons;

  template <std::size_t index>
  void place(const SKIA_Rect& area);
  void choose(std::size_t index);
  void followKey(unsigned int code);
  void followOwnKey(unsigned int code);

  Current<VerdictBar> current{this};
  std::atomic<Outcome> chosen = Outcome::Running;
  std::atomic<int> marked = -1;  // -1: no key moved it yet
  Buttons buttons;
  std::optional<Veil> veil;
  std::optional<MW::Key> key;
};

/// The key that leaves a screen.
inline constexpr unsigned int kKeyBack = BRIMOL_CODE_BACK;

}  // namespace factory_test
