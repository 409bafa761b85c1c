// Which pauses a record ends, on the thread that handles it and on the application's own.
#include "input/early_ends.h"

#include <gtest/gtest.h>

#include <barrier>
#include <thread>

namespace brimol::pc {
namespace {

constexpr uint32_t kLoopMs = 5;

// A pause that begins now, and whether it ends at once.
bool endsAtOnce(EarlyEnds& ends, uint32_t ms) {
  EarlyEnds::Pause pause(ends, ms);
  const bool isOver = pause.isOver();
  if (isOver) pause.endEarly();
  return isOver;
}

TEST(EarlyEnds, FollowARecordFromThreadToThread) {
  EarlyEnds ends;
  std::barrier turn(2);
  std::thread loop([&] {
    EXPECT_FALSE(endsAtOnce(ends, kLoopMs));
    turn.arrive_and_wait();
    turn.arrive_and_wait();
    EXPECT_FALSE(endsAtOnce(ends, kLoopMs)) << "the record is still being handled";
    turn.arrive_and_wait();
    turn.arrive_and_wait();
    EXPECT_FALSE(endsAtOnce(ends, EarlyEnds::kLongest + 1)) << "a long pause lasts its time";
    EXPECT_TRUE(endsAtOnce(ends, kLoopMs));
    EXPECT_FALSE(endsAtOnce(ends, kLoopMs)) << "once is enough, for two records too";
  });
  turn.arrive_and_wait();
  EXPECT_FALSE(endsAtOnce(ends, 1));
  ends.hearOfPoll(true);
  EXPECT_FALSE(endsAtOnce(ends, 1)) << "the polling thread has not passed it on yet";
  ends.hearOfPoll(true);
  ends.hearOfPoll(false);
  EXPECT_TRUE(endsAtOnce(ends, 1));
  turn.arrive_and_wait();
  turn.arrive_and_wait();
  EXPECT_TRUE(endsAtOnce(ends, 1)) << "once for each record";
  EXPECT_FALSE(endsAtOnce(ends, 1));
  ends.hearOfPoll(false);
  EXPECT_FALSE(endsAtOnce(ends, 1)) << "a poll without a record passes nothing on";
  turn.arrive_and_wait();
  loop.join();
}

}  // namespace
}  // namespace brimol::pc
