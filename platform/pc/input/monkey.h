/// A user who knows nothing and never tires.
#pragma once

#include <cstdint>
#include <deque>
#include <functional>
#include <optional>
#include <random>

#include "input/script_fingers.h"
#include "scene/scene.h"

namespace brimol::pc {

struct MonkeyWish {
  uint64_t seed = 0;
  uint64_t events = 10'000;  // records, at least
  uint64_t restMs = 0;       // after each hundred of them
};

/// Makes up taps, drags, long presses, up to ten fingers, keys and plugs, at random places and on
/// what the screen shows. The same seed on the same screen does the same. It reads no clock and
/// knows no thread: one call at a time. Times are milliseconds since the session's start and do not
/// run back.
class Monkey {
 public:
  using Post = ScriptFingers::Post;

  /// It has posted at least the wished records when it is over; no finger is down then.
  Monkey(const MonkeyWish& wish, Size screenSize, Post receiver);

  /// When act() is to be called next; none: not before a frame was seen, or not any more.
  std::optional<uint64_t> due(uint64_t soonest) const;
  /// `shown` is the newest frame.
  void act(uint64_t now, const Frame& shown);
  /// A frame was drawn that differs from the one before.
  void seeFrame(uint64_t now, const Frame& shown);

  bool isOver() const { return over; }
  uint64_t posted() const { return count; }
  /// So many records came since anything new was shown: items in other places than in any of the
  /// layouts before. What blinks, or tells the time, shows nothing new.
  uint64_t sinceNews() const { return count - countAtNews; }

 private:
  struct Planned {
    uint64_t time;
    std::function<void(uint64_t now)> action;
  };
  struct Habit;

  static const Habit& habitFor(uint32_t share);

  uint32_t below(uint32_t end) { return static_cast<uint32_t>(random() % end); }
  ScreenPoint anywhere();
  ScreenPoint somewhere(const Frame& shown);
  void plan(uint32_t laterMs, std::function<void(uint64_t now)> action);
  void planPress(int finger, ScreenPoint place, uint32_t holdMs);
  void planMoves(int finger, int steps);
  void planKey(uint32_t code);
  void post(const Event& record);
  void decide(uint64_t now, const Frame& shown);
  void restIfTired();

  void tap(const Frame& shown);
  void tapTwice(const Frame& shown);
  void hold(const Frame& shown);
  void drag(const Frame& shown);
  void useManyFingers(const Frame& shown);
  void pressKey(const Frame& shown);
  void plug(const Frame& shown);
  void rest(const Frame& shown);

  Size screen;
  Post target;
  ScriptFingers fingers;
  std::mt19937_64 random;
  MonkeyWish wanted;
  uint64_t count = 0;
  uint64_t nextRest;  // so many records have come then
  uint64_t countAtNews = 0;
  std::deque<std::size_t> layouts;    // the last ones that were new
  std::deque<Planned> planned;        // in the order of their times
  std::optional<uint64_t> nextHabit;  // none: no frame was seen yet
  uint64_t planTime = 0;              // when what is planned last happens
  bool over = false;
};

}  // namespace brimol::pc
