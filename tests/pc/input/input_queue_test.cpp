#include "input/input_queue.h"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <vector>

#include "input/event_records.h"
#include "pc/support/record_text.h"

namespace brimol::pc {
namespace {

const Event kKeyDown = keyRecord(BRIMOL_KEY_DOWN, 273);
const Event kKeyUp = keyRecord(BRIMOL_KEY_UP, 273);
const Event kLong = pointerRecord(BRIMOL_LONG_PRESS, 0, {0, 0});

Event motion(int finger, int x, int xrel) {
  Event record = pointerRecord(BRIMOL_POINTER_MOTION, finger, {x, 0});
  record.pointer.xrel = static_cast<int16_t>(xrel);
  return record;
}
Event down(int finger) { return pointerRecord(BRIMOL_POINTER_DOWN, finger, {0, 0}); }
Event up(int finger) { return pointerRecord(BRIMOL_POINTER_UP, finger, {0, 0}); }

struct QueueCase {
  const char* name;
  std::vector<Event> pushed;
  std::vector<std::string> kept;  // by a queue with room for three
};

const auto kQueueCases = std::to_array<QueueCase>({
    {"motions of a finger merge, though others move between",
     {motion(0, 2, 2), motion(1, 5, 5), motion(0, 5, 3), motion(0, 6, 1)},
     {"motion 0 at 6,0 by 6,0", "motion 1 at 5,0 by 5,0"}},
    {"motions stay on their side of what happened between",
     {motion(0, 2, 2), down(1), motion(0, 5, 3)},
     {"motion 0 at 2,0 by 2,0", "down 1 at 0,0", "motion 0 at 5,0 by 3,0"}},
    {"the oldest motion of the finger makes room",
     {motion(0, 2, 2), down(1), motion(0, 5, 3), up(1), motion(0, 6, 1)},
     {"down 1 at 0,0", "up 1 at 0,0", "motion 0 at 6,0 by 6,0"}},
    {"motion is not added beyond a release",
     {motion(0, 5, 5), up(0), down(0), motion(0, 1, 1)},
     {"up 0 at 0,0", "down 0 at 0,0", "motion 0 at 1,0 by 1,0"}},
    {"sums stay in their words",
     {motion(0, 0, -32000), motion(0, 0, -32000), up(0), down(1)},
     {"motion 0 at 0,0 by -32768,0", "up 0 at 0,0", "down 1 at 0,0"}},
    {"a long press leaves before a press",
     {down(0), kLong, up(0), down(0)},
     {"down 0 at 0,0", "up 0 at 0,0", "down 0 at 0,0"}},
    {"a press leaves with its release",
     {up(1), kKeyDown, down(1), kKeyUp},
     {"up 1 at 0,0", "down 1 at 0,0"}},
    {"presses without release are bounded too",
     {down(0), down(1), down(2), down(3)},
     {"down 1 at 0,0", "down 2 at 0,0", "down 3 at 0,0"}},
});

TEST(InputQueue, MakesRoomSoThatNoFingerStaysDown) {
  for (const auto& [name, pushed, kept] : kQueueCases) {
    InputQueue queue(3);
    for (const Event& record : pushed) queue.push(record);
    std::vector<std::string> taken;
    for (Event record = {}; queue.take(record);) taken.push_back(textOf(record));
    EXPECT_EQ(taken, kept) << name;
  }
}

}  // namespace
}  // namespace brimol::pc
