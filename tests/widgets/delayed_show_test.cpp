#include <MW/detail/delayed_show.h>

#include <initializer_list>

namespace {

// Whether it draws in each of these passes, as digits.
constexpr int draws(MW::DelayedShow show, std::initializer_list<uint32_t> passes) {
  int digits = 0;
  for (const uint32_t now : passes) digits = digits * 10 + (show.draws(now) ? 1 : 0);
  return digits;
}
constexpr MW::DelayedShow startedAt(uint32_t now, uint32_t delayMs) {
  MW::DelayedShow show;
  show.start(now, delayMs);
  return show;
}
static_assert(draws({}, {0, 1}) == 11);
static_assert(draws(startedAt(1000, 250), {1249, 1250, 0}) == 11);

// Due from its tick on, pending until it is drawn.
static_assert(!startedAt(1000, 250).isDue(1249) && startedAt(1000, 250).isDue(1250));
static_assert(startedAt(1000, 250).isPending() && !MW::DelayedShow().isDue(9));

// A due time beyond the wrap of the clock counts as reached.
static_assert(startedAt(~15U, 250).isDue(~15U));

}  // namespace
