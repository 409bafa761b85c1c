#include <MW/detail/double_tap.h>

#include <initializer_list>

namespace {

struct Tap {
  uint32_t pressed, released;
};

// The count of each tap as a digit; 0: it does not count.
constexpr int counts(std::initializer_list<Tap> taps) {
  MW::DoubleTap doubleTap;
  int digits = 0;
  for (const Tap& tap : taps) {
    doubleTap.press(tap.pressed);
    digits = digits * 10 + (doubleTap.isRunning() ? doubleTap.tap(tap.released) : 0);
  }
  return digits;
}
static_assert(counts({{1000, 1100}, {1200, 1300}, {1400, 1500}}) == 123);

// The last tick of a tap, and of the time between two releases.
static_assert(counts({{1000, 1499}, {1600, 1998}}) == 12);
static_assert(counts({{1000, 1500}, {1600, 1700}}) == 1);
static_assert(counts({{1000, 1100}, {1200, 1600}, {1700, 1800}}) == 101);

// A press forgets a tap that is older than the time, and no younger one.
static_assert(counts({{1000, 1100}, {1601, 1650}}) == 11);
static_assert(counts({{1000, 1100}, {1600, 1601}}) == 10);

// Tick 0 stands for none, and the wrap cuts a series short.
static_assert(counts({{0, 0}, {900, 1000}, {1100, 1200}}) == 12);
static_assert(counts({{~15U, ~7U}, {2, 10}, {1000, 1100}, {1200, 1300}}) == 112);

}  // namespace
