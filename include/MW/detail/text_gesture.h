/// What a finger does on a text panel.
#pragma once

#include <MW/detail/double_tap.h>

#include <cstdint>

namespace MW {

/// What happened on a text panel, each with a callback of its own.
enum class TextTouch { None, Press, Release, LongPress, DoubleTap };

/// Is told of a finger's taps on a panel and answers what happened. Times are GetTicks()
/// milliseconds. One thread, the one that handles events.
class TextGesture {
 public:
  /// To be called after each press if the panel wants double taps.
  constexpr void awaitTap(uint32_t now) { taps.press(now); }
  /// Whether what has happened ends a tap, which tap() is then told of.
  constexpr bool isTapDue(TextTouch what) const {
    return what == TextTouch::Release && taps.isRunning();
  }
  /// A tap: the second of a series is a double tap, a third is not.
  constexpr TextTouch tap(uint32_t now) {
    counted = taps.tap(now);
    return counted == DoubleTap::kDouble ? TextTouch::DoubleTap : TextTouch::None;
  }
  /// The number of the last tap in its series, from 1; 0 where it came too late, or none did yet.
  constexpr int tapNumber() const { return counted; }
  constexpr void reset() { *this = TextGesture(); }

 private:
  DoubleTap taps;
  int counted = 0;
};

}  // namespace MW
