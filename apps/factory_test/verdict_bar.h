/// PASS, RETRY and FAIL at the foot of a test's screen.
#pragma once

#include <MW/button3.h>
#include <MW/key.h>
#include <brimol/input.h>

#include <array>
#include <atomic>
#include <optional>

#include "current.h"
#include "test.h"

namespace factory_test {

/// Three buttons, and the keys: left and right move between them, select takes one, back leaves the
/// test. They are on the screen from construction to destruction; there is one bar at a time.
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
  void choose(Outcome outcome) { chosen = outcome; }

 private:
  static constexpr std::size_t kButtons = 3;

  void followKey(unsigned int code);

  Current<VerdictBar> current{this};
  std::atomic<Outcome> chosen = Outcome::Running;
  std::atomic<int> marked = -1;  // -1: no key moved it yet
  std::array<std::optional<MW::Button3>, kButtons> buttons;
  std::optional<MW::Key> key;
};

/// The key that leaves a screen.
inline constexpr unsigned int kKeyBack = BRIMOL_CODE_BACK;

}  // namespace factory_test
