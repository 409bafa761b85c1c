#include <MW/detail/delayed_show.h>

#include <initializer_list>

namespace {

// Whether it draws in each of these passes, as digits.
constexpr int draws(MW::DelayedShow show, std::initializer_list<uint32_t> passes) {
  int digits = 0;
  for (const uint32_t now : passes) digits = digits * 10 + (show.draws(now) ? 1 : 0);
  return digits;
}
constexpr MW::DelayedShow startedAt(uint32_t now, int delayMs) {
  MW::DelayedShow show;
  show.start(now, delayMs);
  return show;
}
static_assert(draws({}, {0, 1}) == 11);
static_assert(draws(startedAt(1000, 250), {1249, 1250, 0}) == 11);

// Due from its tick on, pending until it is drawn.
static_assert(!startedAt(1000, 250).isDue(1249) && startedAt(1000, 250).isDue(1250));
static_assert(startedAt(1000, 250).isPending() && !MW::DelayedShow().isDue(9));

// Over the wrap of the clock, and from its start.
static_assert(draws(startedAt(~15U, 250), {~15U, ~0U, 233, 234}) == 1);
static_assert(draws(startedAt(0, 0), {0}) == 1 && draws(startedAt(0, 5), {0, 4, 5}) == 1);

constexpr uint32_t kMonthMs = 31U * 86'400'000;
static_assert(startedAt(1000, 250).isDue(1250 + kMonthMs), "hidden for a month");
static_assert(startedAt(1000, -1).isDue(1000) && startedAt(~0U, 1).isDue(0));

}  // namespace
