#include <MW/detail/text_gesture.h>

#include <initializer_list>

// Checked where they are compiled: what a finger on a text panel makes happen.

namespace {

using MW::TextGesture;
using MW::TextTouch;

static_assert(TextGesture().press() == TextTouch::Press);
static_assert(TextGesture().longPress() == TextTouch::LongPress);
static_assert(TextGesture().release(true) == TextTouch::Release);
static_assert(TextGesture().release(false) == TextTouch::None);

enum class Start { Press, LongPress, Nothing };
enum class End { Inside, Outside };

// Whether a tap was awaited and ended.
constexpr bool isTap(Start start, End end) {
  TextGesture gesture;
  if (start == Start::Press) gesture.press();
  if (start == Start::LongPress) gesture.longPress();
  gesture.awaitTap(1000);
  gesture.release(end == End::Inside);
  return gesture.endedTap();
}
static_assert(isTap(Start::Press, End::Inside) && !isTap(Start::Press, End::Outside));
static_assert(!isTap(Start::LongPress, End::Inside) && !isTap(Start::Nothing, End::Inside));

// The number of the last of several taps, each so long after the one before; negative where it is a
// double tap.
constexpr int lastOf(std::initializer_list<uint32_t> pauses, uint32_t start = 1000) {
  TextGesture gesture;
  gesture.press();
  gesture.awaitTap(start);
  uint32_t now = start;
  TextTouch what = TextTouch::None;
  for (const uint32_t pause : pauses) what = gesture.tap(now += pause);
  return what == TextTouch::DoubleTap ? -gesture.tapNumber() : gesture.tapNumber();
}
static_assert(lastOf({499}) == 1 && lastOf({500}) == 0);
static_assert(lastOf({499, 499}) == -2 && lastOf({499, 500}) == 0);
static_assert(lastOf({1, 1, 1}) == 3, "a third one is no double tap");
static_assert(lastOf({1, 1}, UINT32_MAX - 600) == -2, "close to the clock's wrap");

}  // namespace
