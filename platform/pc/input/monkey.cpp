#include "input/monkey.h"

#include <algorithm>
#include <array>
#include <utility>

#include "input/event_records.h"
#include "input/pointers.h"
#include "scene/item.h"

namespace brimol::pc {

namespace {

constexpr uint64_t kFirstMs = 100;  // after the first frame
constexpr uint32_t kMostPauseMs = 40;
constexpr uint32_t kMostRestMs = 3000;
constexpr uint32_t kMoveMs = 10;
constexpr uint64_t kTiringEvents = 100;
constexpr uint32_t kLongMs = 700;  // more than a long press

constexpr auto kKeys = std::to_array<uint32_t>(
    {BRIMOL_CODE_UP, BRIMOL_CODE_DOWN, BRIMOL_CODE_LEFT, BRIMOL_CODE_RIGHT, BRIMOL_CODE_SELECT,
     BRIMOL_CODE_BACK, BRIMOL_CODE_BACK, BRIMOL_CODE_HOOK, BRIMOL_CODE_HOME, BRIMOL_CODE_POWER,
     BRIMOL_CODE_VOLUME_UP, BRIMOL_CODE_VOLUME_DOWN, 0});

// Codes of plugs that widgets know, and one that they do not.
constexpr auto kPlugs = std::to_array<uint32_t>({2, 17, 18, 40});

constexpr std::size_t kMostLayouts = 32;  // more than a blinking or growing dialog has

// A number that tells frames apart by where their items are.
std::size_t layoutOf(const Frame& shown) {
  std::size_t layout = 0;
  for (const SKIA_Item& item : shown) {
    for (const int32_t number : {item.kind, item.rect.x, item.rect.y, item.rect.w, item.rect.h,
                                 item.point.x1, item.point.y1, item.point.x2, item.point.y2}) {
      constexpr std::size_t kFactor = 1'000'003;
      layout = layout * kFactor + static_cast<std::size_t>(number);
    }
  }
  return layout;
}

}  // namespace

/// What it does in `share` of a hundred cases.
struct Monkey::Habit {
  uint32_t share;
  void (Monkey::*act)(const Frame& shown);
};

const Monkey::Habit& Monkey::habitFor(uint32_t share) {
  static constexpr auto kHabits = std::to_array<Habit>({{51, &Monkey::tap},
                                                        {8, &Monkey::tapTwice},
                                                        {3, &Monkey::hold},
                                                        {12, &Monkey::drag},
                                                        {6, &Monkey::useManyFingers},
                                                        {16, &Monkey::pressKey},
                                                        {3, &Monkey::plug},
                                                        {1, &Monkey::rest}});
  const Habit* habit = kHabits.data();
  while (share >= habit->share) share -= (habit++)->share;
  return *habit;
}

Monkey::Monkey(const MonkeyWish& wish, Size screenSize, Post receiver)
    : screen(screenSize),
      target(std::move(receiver)),
      fingers(screenSize, [this](const Event& record) { post(record); }),
      random(wish.seed),
      wanted(wish),
      nextRest(kTiringEvents) {}

void Monkey::post(const Event& record) {
  ++count;
  target(record);
}

void Monkey::seeFrame(uint64_t now, const Frame& shown) {
  if (!nextHabit) nextHabit = now + kFirstMs;
  const std::size_t layout = layoutOf(shown);
  if (std::ranges::find(layouts, layout) != layouts.end()) return;
  countAtNews = count;
  layouts.push_back(layout);
  if (layouts.size() > kMostLayouts) layouts.pop_front();
}

std::optional<uint64_t> Monkey::due(uint64_t soonest) const {
  if (over || !nextHabit) return std::nullopt;
  uint64_t moment = planned.empty() ? *nextHabit : planned.front().time;
  if (const auto longPress = fingers.due(soonest)) moment = std::min(moment, *longPress);
  return std::max(moment, soonest);
}

void Monkey::act(uint64_t now, const Frame& shown) {
  if (over || !nextHabit) return;
  fingers.tick(now);
  while (!planned.empty() && planned.front().time <= now) {
    const Planned next = std::move(planned.front());
    planned.pop_front();
    next.action(now);
  }
  if (!planned.empty() || now < *nextHabit) return;
  over = count >= wanted.events;
  if (!over) decide(now, shown);
}

void Monkey::decide(uint64_t now, const Frame& shown) {
  planTime = now;
  (this->*habitFor(below(100)).act)(shown);
  restIfTired();
  nextHabit = planTime + below(kMostPauseMs);
}

// What is planned comes before the rest.
void Monkey::restIfTired() {
  if (count < nextRest) return;
  nextRest = count + kTiringEvents;
  planTime += wanted.restMs;
}

void Monkey::plan(uint32_t laterMs, std::function<void(uint64_t now)> action) {
  planTime += laterMs;
  planned.push_back({planTime, std::move(action)});
}

ScreenPoint Monkey::anywhere() {
  return {static_cast<int>(below(static_cast<uint32_t>(screen.w))),
          static_cast<int>(below(static_cast<uint32_t>(screen.h)))};
}

// Mostly what is shown, since most places of a screen do nothing.
ScreenPoint Monkey::somewhere(const Frame& shown) {
  if (shown.empty() || below(4) == 0) return anywhere();
  const SKIA_Item& item = shown[below(static_cast<uint32_t>(shown.size()))];
  const Pixels area = boundsOf(item, {0, 0, screen.w, screen.h});
  if (area.width <= 0 || area.height <= 0) return anywhere();
  return {area.x + static_cast<int>(below(static_cast<uint32_t>(area.width))),
          area.y + static_cast<int>(below(static_cast<uint32_t>(area.height)))};
}

void Monkey::planPress(int finger, ScreenPoint place, uint32_t holdMs) {
  plan(0, [this, finger, place](uint64_t now) { fingers.press(finger, place, now); });
  plan(holdMs, [this, finger](uint64_t) { fingers.release(finger); });
}

void Monkey::planMoves(int finger, int steps) {
  for (int step = 0; step < steps; ++step) {
    const ScreenPoint by = anywhere();
    plan(kMoveMs, [this, finger, by](uint64_t) {
      constexpr int kReach = 8;  // a step is up to an eighth of the screen
      const ScreenPoint from = fingers.position(finger);
      fingers.move(finger, {from.x + (2 * by.x - screen.w) / kReach,
                            from.y + (2 * by.y - screen.h) / kReach});
    });
  }
}

// Each number is drawn in a statement of its own: compilers differ in the order of arguments.
void Monkey::tap(const Frame& shown) {
  const ScreenPoint place = somewhere(shown);
  planPress(0, place, 5 + below(60));
}

void Monkey::tapTwice(const Frame& shown) {
  const ScreenPoint place = somewhere(shown);
  planPress(0, place, 20 + below(60));
  plan(20 + below(250), [](uint64_t) {});
  planPress(0, place, 20 + below(60));
}

void Monkey::hold(const Frame& shown) {
  const ScreenPoint place = somewhere(shown);
  planPress(0, place, kLongMs + below(kLongMs));
}

void Monkey::drag(const Frame& shown) {
  const ScreenPoint from = somewhere(shown);
  plan(0, [this, from](uint64_t now) { fingers.press(0, from, now); });
  planMoves(0, 2 + static_cast<int>(below(10)));
  plan(kMoveMs, [this](uint64_t) { fingers.release(0); });
}

void Monkey::useManyFingers(const Frame& shown) {
  const int last = 1 + static_cast<int>(below(Pointers::kFingers - 1));
  for (int finger = 0; finger <= last; ++finger) {
    const ScreenPoint place = somewhere(shown);
    plan(below(20), [this, finger, place](uint64_t now) { fingers.press(finger, place, now); });
  }
  for (int finger = 0; finger <= last; ++finger) planMoves(finger, static_cast<int>(below(4)));
  for (int finger = last; finger >= 0; --finger) {
    plan(below(20), [this, finger](uint64_t) { fingers.release(finger); });
  }
}

void Monkey::planKey(uint32_t code) {
  plan(0, [this, code](uint64_t) { post(keyRecord(BRIMOL_KEY_DOWN, code)); });
  plan(5 + below(40), [this, code](uint64_t) { post(keyRecord(BRIMOL_KEY_UP, code)); });
}

void Monkey::pressKey(const Frame&) {
  const uint32_t code = kKeys.at(below(kKeys.size()));
  for (uint32_t times = 1 + below(3); times > 0; --times) planKey(code);
}

void Monkey::plug(const Frame&) {
  const uint32_t code = kPlugs.at(below(kPlugs.size()));
  plan(0, [this, code](uint64_t) { post(userRecord(code, 1)); });
  plan(below(kMostPauseMs), [](uint64_t) {});
}

void Monkey::rest(const Frame&) {
  plan(below(kMostRestMs), [](uint64_t) {});
}

}  // namespace brimol::pc
