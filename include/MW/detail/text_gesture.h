/// What a finger does on a text panel.
#pragma once

#include <MW/detail/double_tap.h>

#include <cstdint>

namespace MW {

/// What happened on a text panel, each with a callback of its own.
enum class TextTouch { None, Press, Release, LongPress, DoubleTap };

/// Is told of a finger on a panel and answers what happened. Times are GetTicks() milliseconds. One
/// thread, the one that handles events.
class TextGesture {
 public:
  constexpr TextTouch press() { return last = TextTouch::Press; }
  constexpr TextTouch longPress() { return last = TextTouch::LongPress; }
  /// Outside the panel nothing happens.
  constexpr TextTouch release(bool isInside) {
    return last = isInside ? TextTouch::Release : TextTouch::None;
  }
  /// Behind each press of a panel that wants double taps.
  constexpr void awaitTap(uint32_t now) {
    if (last == TextTouch::Press) taps.press(now);
  }
  /// Whether a release ended an awaited tap, which tap() is then told of.
  constexpr bool endedTap() const { return last == TextTouch::Release && taps.isRunning(); }
  /// A tap: the second of a series is a double tap, a third is not.
  constexpr TextTouch tap(uint32_t now) {
    counted = taps.tap(now);
    return counted == DoubleTap::kDouble ? TextTouch::DoubleTap : TextTouch::None;
  }
  /// The number of the last tap in its series, from 1; 0 where it came too late.
  constexpr int tapNumber() const { return counted; }
  constexpr void reset() { *this = TextGesture(); }

 private:
  TextTouch last = TextTouch::None;
  DoubleTap taps;
  int counted = 0;
};

}  // namespace MW
