#include <MW/detail/text_gesture.h>

#include <initializer_list>

namespace {

using MW::TextTouch;

struct Tap {
  uint32_t pressed, released;
  TextTouch what = TextTouch::Release;  // that the release was for the panel
};

// A digit for each tap: 0 none was due, 1 one that tells nothing, 2 a double tap.
constexpr int told(std::initializer_list<Tap> taps) {
  MW::TextGesture gesture;
  int digits = 0;
  for (const Tap& tap : taps) {
    gesture.awaitTap(tap.pressed);
    digits *= 10;
    if (gesture.isTapDue(tap.what)) digits += gesture.tap(tap.released) == TextTouch::None ? 1 : 2;
  }
  return digits;
}
static_assert(told({{1000, 1100}, {1200, 1300}, {1400, 1500}}) == 121, "a third tells nothing");
static_assert(told({{1000, 1100}, {1200, 1600}, {1700, 1800}, {1900, 2000}}) == 1112, "late");
static_assert(told({{1000, 1100}, {1200, 1300, TextTouch::None}, {1400, 1500}}) == 102, "outside");
static_assert(!MW::TextGesture().isTapDue(TextTouch::Release), "not awaited");
static_assert(MW::TextGesture().tapNumber() == 0, "none yet");

}  // namespace
