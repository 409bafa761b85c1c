#include <MW/detail/key_clicks.h>

#include <initializer_list>

namespace {

struct Click {
  uint32_t code, at;
};

// The count of each release as a digit.
constexpr int counts(std::initializer_list<Click> clicks) {
  MW::KeyClicks keyClicks;
  int digits = 0;
  for (const auto& [code, at] : clicks) {
    keyClicks.follow({1, code}, at);
    digits = digits * 10 + keyClicks.click(code, at);
  }
  return digits;
}
static_assert(counts({{5, 1000}, {5, 1999}, {5, 2998}, {5, 2998}}) == 1234);
static_assert(counts({{5, 1000}, {5, 2000}, {5, 2001}}) == 112);
static_assert(counts({{5, 1000}, {6, 1001}, {5, 1002}, {5, 1003}}) == 1112);

// The code that stands for no key is a key like any other.
static_assert(counts({{65535, 1000}, {65535, 1001}}) == 12);

constexpr uint32_t kDay = 24 * 60 * 60 * 1000;

// Where the clock starts, and where it starts over.
static_assert(counts({{5, 0}, {5, 0}, {5, 999}, {5, 1999}}) == 1231);
static_assert(counts({{5, 0U - 1001}, {5, 0U - 1000}, {5, 0U - 1000}}) == 121, "just before");
static_assert(counts({{5, ~15U}, {5, ~7U}, {5, 10}, {5, 11}}) == 1123, "over the wrap");
static_assert(counts({{5, 0U - 1000}, {5, 0}}) == 11, "over the wrap, too late");
static_assert(counts({{5, 0U - kDay}, {5, kDay}, {5, 2 * kDay}}) == 121, "far");

// A key that is not followed ends the series.
constexpr int countAfterAnother() {
  MW::KeyClicks keyClicks;
  keyClicks.follow({1, 5}, 1000);
  keyClicks.click(5, 1000);
  keyClicks.click(6, 1001);
  return keyClicks.click(5, 1002);
}
static_assert(countAfterAnother() == 0);

}  // namespace
