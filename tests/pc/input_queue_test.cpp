#include "input/input_queue.h"

#include <gtest/gtest.h>

#include <array>

#include "input/event_records.h"
#include "record_text.h"

namespace brimol::pc {
namespace {

constexpr std::size_t kRoom = 4;
constexpr uint32_t kKey = 273;

Event motion(int finger, int x, int xrel) {
  Event record = pointerRecord(BRIMOL_POINTER_MOTION, finger, {x, 0});
  record.pointer.xrel = static_cast<int16_t>(xrel);
  return record;
}
Event down(int finger) { return pointerRecord(BRIMOL_POINTER_DOWN, finger, {0, 0}); }
Event up(int finger) { return pointerRecord(BRIMOL_POINTER_UP, finger, {0, 0}); }

struct QueueCase {
  const char* name;
  std::vector<Event> pushed;  // one more than there is room for
  std::vector<std::string> kept;
};

const auto kCases = std::to_array<QueueCase>({
    {"OldestMotionOfTheFingerMerges",
     {down(0), motion(1, 5, 5), motion(0, 2, 2), motion(0, 5, 3), motion(0, 6, 1)},
     {"down 0 at 0,0", "motion 1 at 5,0 by 5,0", "motion 0 at 5,0 by 5,0",
      "motion 0 at 6,0 by 1,0"}},
    {"MotionOfAnotherFingerMakesRoom",
     {down(0), down(1), motion(1, 5, 5), motion(1, 7, 2), up(0)},
     {"down 0 at 0,0", "down 1 at 0,0", "motion 1 at 7,0 by 7,0", "up 0 at 0,0"}},
    {"MotionIsNotAddedBeyondARelease",
     {motion(0, 5, 5), up(0), down(0), motion(0, 1, 1), motion(0, 2, 1)},
     {"up 0 at 0,0", "down 0 at 0,0", "motion 0 at 1,0 by 1,0", "motion 0 at 2,0 by 1,0"}},
    {"SumsStayInTheirWords",
     {motion(0, 0, -32000), motion(0, 0, -32000), up(0), down(1), up(1)},
     {"motion 0 at 0,0 by -32768,0", "up 0 at 0,0", "down 1 at 0,0", "up 1 at 0,0"}},
    {"LongPressLeavesBeforeAPress",
     {down(0), pointerRecord(BRIMOL_LONG_PRESS, 0, {0, 0}), up(0), down(0), up(0)},
     {"down 0 at 0,0", "up 0 at 0,0", "down 0 at 0,0", "up 0 at 0,0"}},
    {"PressLeavesWithItsRelease",
     {up(1), keyRecord(BRIMOL_KEY_DOWN, kKey), down(1), keyRecord(BRIMOL_KEY_UP, kKey),
      motion(1, 1, 1)},
     {"up 1 at 0,0", "down 1 at 0,0", "motion 1 at 1,0 by 1,0"}},
    {"PressesWithoutReleaseAreBoundedToo",
     {down(0), down(1), down(2), down(3), down(4)},
     {"down 1 at 0,0", "down 2 at 0,0", "down 3 at 0,0", "down 4 at 0,0"}},
});

class FullQueue : public testing::TestWithParam<QueueCase> {};

TEST_P(FullQueue, MakesRoom) {
  InputQueue queue(kRoom);
  for (const Event& record : GetParam().pushed) queue.push(record);
  std::vector<std::string> kept;
  Event record = {};
  while (queue.take(record)) kept.push_back(textOf(record));
  EXPECT_EQ(kept, GetParam().kept);
}

INSTANTIATE_TEST_SUITE_P(All, FullQueue, testing::ValuesIn(kCases),
                         [](const auto& row) { return row.param.name; });

TEST(InputQueue, KeepsItsBoundAndEveryPressWhoseReleaseIsLeft) {
  InputQueue queue;
  int presses = 0;
  for (int i = 0; i < 5000; ++i) {
    queue.push(down(i % 7));
    queue.push(motion(i % 7, i, 1));
    queue.push(up(i % 7));
    ASSERT_LE(queue.size(), InputQueue::kCapacity);
  }
  for (Event record = {}; queue.take(record);) {
    if (record.type == BRIMOL_POINTER_DOWN) ++presses;
    if (record.type == BRIMOL_POINTER_UP) --presses;
    ASSERT_TRUE(presses == 0 || presses == 1);
  }
  EXPECT_EQ(presses, 0);
}

}  // namespace
}  // namespace brimol::pc
