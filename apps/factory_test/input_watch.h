/// Every touch and key of a page, one after another.
#pragma once

#include <MW/key.h>
#include <MW/screen.h>

#include <cstdint>
#include <mutex>
#include <optional>
#include <vector>

#include "current.h"

namespace factory_test {

/// A touch that began, moved or ended, or a key that was pressed or released.
struct Input {
  enum class Kind { Press, Move, Lift, KeyPress, KeyRelease };

  Kind kind;
  uint32_t ticks;    // GetTicks() milliseconds when it arrived
  uint32_t finger;   // from 0
  int x;             // pixels, of a touch
  int y;             // the same
  unsigned int key;  // its code, of a key
};

/// Collects all input from construction to destruction; nothing below gets any. There is one at a
/// time.
class InputWatch {
 public:
  InputWatch();
  /// What came since the last call, oldest first. Main thread.
  std::vector<Input> take();

 private:
  void add(Input::Kind kind, const MW::mouse_event& mouse);
  void add(Input::Kind kind, const MW::kbd_event& event);
  void add(const Input& input);

  Current<InputWatch> current{this};
  std::mutex mutex;           // guards the inputs
  std::vector<Input> inputs;  // not taken yet
  std::optional<MW::Screen> touch;
  std::optional<MW::Key> key;
};

}  // namespace factory_test
