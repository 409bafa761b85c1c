/// The fingers of a script.
#pragma once

#include <cstdint>
#include <functional>
#include <optional>
#include <vector>

#include "input/event_records.h"
#include "input/long_press.h"
#include "input/pointers.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// Makes the records of fingers that are named by number, their long presses too. Times are
/// milliseconds and do not run back.
class ScriptFingers {
 public:
  using Post = std::function<void(const Event& record)>;

  ScriptFingers(Size screenSize, Post target);

  bool isDown(int finger) const { return at(finger).isDown; }
  ScreenPoint position(int finger) const { return at(finger).place; }

  /// Positions are clamped to the screen. A finger that is down already moves there.
  void press(int finger, ScreenPoint place, uint64_t now);
  /// A finger that is not down, or stays on its pixel: nothing.
  void move(int finger, ScreenPoint to);
  void release(int finger);

  /// Posts the long presses that are due.
  void tick(uint64_t now);
  /// When the next one is due.
  std::optional<uint64_t> due(uint64_t now) const;

 private:
  struct Finger {
    LongPress longPress;
    bool isDown = false;
    ScreenPoint place = {};
  };
  Finger& at(int finger) { return fingers[static_cast<std::size_t>(finger)]; }
  const Finger& at(int finger) const { return fingers[static_cast<std::size_t>(finger)]; }
  ScreenPoint onScreen(ScreenPoint place) const;

  Size screen;
  Post post;
  std::vector<Finger> fingers;
};

}  // namespace brimol::pc
