#include <MW/detail/delayed_show.h>

namespace {

constexpr MW::DelayedShow startedAt(uint32_t now, uint32_t delayMs) {
  MW::DelayedShow show;
  show.start(now, delayMs);
  return show;
}
constexpr bool drawsAt(MW::DelayedShow show, uint32_t now) { return show.draws(now); }
constexpr MW::DelayedShow drawnAt(MW::DelayedShow show, uint32_t now) {
  show.draws(now);
  return show;
}

// Without a delay it is always drawn and never due.
static_assert(drawsAt({}, 0) && !MW::DelayedShow().isPending() && !MW::DelayedShow().isDue(9));

// It is due from its tick on, and pending until it is drawn.
static_assert(!startedAt(1000, 250).isDue(1249) && startedAt(1000, 250).isDue(1250));
static_assert(!drawsAt(startedAt(1000, 250), 1249) && drawsAt(startedAt(1000, 250), 1250));
static_assert(startedAt(1000, 250).isPending() && drawnAt(startedAt(1000, 250), 1249).isPending());
static_assert(!drawnAt(startedAt(1000, 250), 1250).isPending());
static_assert(drawsAt(drawnAt(startedAt(1000, 250), 1250), 0));

// Times are compared as they are: behind the wrap it is due at once.
static_assert(startedAt(~15U, 250).isDue(~15U) && startedAt(~15U, 0).isDue(~15U));

}  // namespace
