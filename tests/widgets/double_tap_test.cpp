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
static_assert(counts({{1000, 1500}, {1500, 1510}}) == 1, "it begins anew at once");
static_assert(counts({{1000, 1100}, {1200, 1600}, {1700, 1800}}) == 101);

// A press forgets a tap that is older than the time, and no younger one.
static_assert(counts({{1000, 1100}, {1601, 1650}}) == 11);
static_assert(counts({{1000, 1100}, {1600, 1601}}) == 10);

// Tick 0 stands for none.
static_assert(counts({{0, 0}, {900, 1000}, {1100, 1200}}) == 12);
static_assert(counts({{1, 1}, {600, 650}}) == 11, "1 is a time");

constexpr uint32_t kDay = 24 * 60 * 60 * 1000;

// Where the clock starts over.
static_assert(counts({{0U - 501, 0U - 501}, {0U - 400, 0U - 2}, {0U - 1, ~0U}}) == 120,
              "just before");
static_assert(counts({{0U - 500, 0U - 500}, {0U - 400, 0U - 300}}) == 0, "each in the last 500 ms");
static_assert(counts({{0U - 600, 0U - 550}, {0U - 100, 10}}) == 12, "over the wrap");
static_assert(counts({{100, 150}, {250, 300}, {499, 501}, {520, 530}}) == 1112, "just behind it");
static_assert(counts({{0U - kDay, 0U - kDay}, {kDay, kDay}, {2 * kDay, 2 * kDay}}) == 121, "far");
static_assert(counts({{0U - kDay, 0U - kDay}, {499, 500}}) == 11, "far, and just behind it");

}  // namespace
