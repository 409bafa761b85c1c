#include <MW/detail/click_slop.h>

#include <cstdint>
#include <initializer_list>

// Checked where they are compiled: which drags leave a click.

namespace {

using MW::ClickSlop;

struct Motion {
  int dx, dy;
};

// What is left of a press on row 7 after motions, where 28 pixels are allowed.
constexpr int after(std::initializer_list<Motion> motions) {
  ClickSlop click;
  click.press(7);
  for (const auto& [dx, dy] : motions) click.move(dx, dy, 28);
  return click.row();
}
constexpr int kGone = ClickSlop::kNone;

static_assert(after({{28, -28}}) == 7 && after({{-28, 28}}) == 7);
static_assert(after({{29, 0}}) == kGone && after({{-29, 0}}) == kGone);
static_assert(after({{0, 29}}) == kGone && after({{0, -29}}) == kGone);
static_assert(after({{20, 0}, {-20, 20}, {20, -20}}) == 7, "sums, not ways");
static_assert(after({{29, 0}, {-29, 0}}) == kGone, "given up for good");
static_assert(after({{INT32_MIN, INT32_MAX}, {INT32_MIN, INT32_MAX}}) == kGone);

}  // namespace
