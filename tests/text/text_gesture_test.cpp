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

constexpr TextGesture awaiting(TextTouch what, uint32_t now = 1000) {
  TextGesture gesture;
  gesture.awaitTap(what, now);
  return gesture;
}
static_assert(awaiting(TextTouch::Press).isTap(TextTouch::Release));
static_assert(!awaiting(TextTouch::Press).isTap(TextTouch::None), "lifted outside");
static_assert(!awaiting(TextTouch::LongPress).isTap(TextTouch::Release));
static_assert(!awaiting(TextTouch::None).isTap(TextTouch::Release));

// The number of the last of several taps, each so long after the one before; negative where it is a
// double tap.
constexpr int lastOf(std::initializer_list<uint32_t> pauses, uint32_t start = 1000) {
  TextGesture gesture = awaiting(TextTouch::Press, start);
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
