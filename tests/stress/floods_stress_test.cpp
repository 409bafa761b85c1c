// More than any finger can do: a hundred thousand events at once, a thousand starts and ends.

#include <MW/event_service.h>

#include <deque>
#include <filesystem>
#include <iterator>
#include <thread>

#include "core/dispatch_thread.h"
#include "support/allocated_bytes.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Window;

constexpr unsigned int kEvents = 100'000;
constexpr unsigned int kFingers = 10;

// Ten fingers that report a thousand times a second each; the place is the event's number.
Event numbered(unsigned int number) {
  Event event = pointerInput(BRIMOL_POINTER_MOTION,
                             {static_cast<int>(number & 0xFFFF), static_cast<int>(number >> 16)});
  event.pointer.finger = static_cast<uint8_t>(number % kFingers);
  return event;
}

// The input thread takes all of them in one turn; the test then dispatches them.
TEST_F(LiveWindowTest, AFloodKeepsItsOrderAndGivesItsMemoryBack) {
  const android::sp<MW::func_dispatchEvent> dispatcher = new MW::func_dispatchEvent;
  unsigned int next = 0;
  ProbeWidget widget;
  widget.onEvent = [&next](MW::event_data* event, auto) {
    const auto number = static_cast<unsigned int>(event->mouse.x | event->mouse.y << 16);
    if (number == next && event->mouse.finger == number % kFingers) ++next;
    return true;
  };
  widget.enter();
  platform().records = false;
  const std::size_t before = allocatedBytes();
  for (unsigned int number = 0; number < kEvents; ++number) platform().feed(numbered(number));
  platform().turns.give(platform().ticks);
  EXPECT_GT(allocatedBytes(), before + kEvents * sizeof(MW::event_data));
  for (unsigned int round = 0; round < kEvents; ++round) dispatcher->threadLoop();
  EXPECT_EQ(next, kEvents);
  EXPECT_EQ(MW::EventService::recvEvent(), nullptr);
  EXPECT_LE(platform().paused, kEvents) << "more than a millisecond an event";
  std::deque<Event>().swap(platform().fed);  // what it keeps for itself is not the toolkit's
  EXPECT_LT(allocatedBytes(), before + (std::size_t{1} << 16));
}

// One second of ten fingers at 1,000 Hz. The dispatch thread takes an event in each of its rounds,
// which last a millisecond here.
TEST_F(LiveWindowTest, TenFingersAtAThousandHertzKeepTheirOrder) {
  constexpr unsigned int kMs = 1000;
  unsigned int next = 0;
  ProbeWidget widget;
  widget.onEvent = [&next](MW::event_data* event, auto) {
    if (event->mouse.x == static_cast<int>(next) && event->mouse.finger == next % kFingers) ++next;
    return true;
  };
  widget.enter();
  unsigned int rounds = 0;
  for (; rounds <= kMs * kFingers && next < kMs * kFingers; ++rounds) {
    for (unsigned int finger = 0; rounds < kMs && finger < kFingers; ++finger) {
      platform().feed(numbered(rounds * kFingers + finger));
    }
    platform().turns.give(++platform().ticks);
    EXPECT_TRUE(platform().fed.empty()) << "input is taken as it comes";
  }
  EXPECT_EQ(next, kMs * kFingers);
}

std::ptrdiff_t entriesOf(const char* folder) {
  const std::filesystem::directory_iterator all(folder);
  return std::distance(begin(all), end(all));
}
std::ptrdiff_t threads() { return entriesOf("/proc/self/task"); }
std::ptrdiff_t openFiles() { return entriesOf("/proc/self/fd"); }

TEST_F(WidgetTest, AThousandStartsAndEndsLeaveNothing) {
  constexpr std::size_t kStarts = 1000;
  platform().records = false;
  const auto startAndEnd = [] {
    EXPECT_EQ(Window::init(), 1);
    Window::destroy();
  };
  // The smallest block that a start can keep takes more than 8 bytes. A sanitizer keeps some
  // itself.
  const std::size_t most = hasSanitizer() ? std::size_t{1} << 16 : 8 * kStarts;
  std::thread([] {}).join();  // a sanitizer adds a thread of its own to the first one
  const std::ptrdiff_t threadsBefore = threads();
  // The allocator's caches fill with the first ones; as threads meet, a little is added later.
  for (int i = 0; i < 250; ++i) startAndEnd();
  const std::size_t before = allocatedBytes();
  const std::ptrdiff_t filesBefore = openFiles();
  for (std::size_t i = 0; i < kStarts; ++i) startAndEnd();
  EXPECT_LE(openFiles(), filesBefore + (hasSanitizer() ? 9 : 0)) << "it opens some for itself";
  // The last ones have done their work; the system may still take them down.
  while (threads() > threadsBefore) std::this_thread::yield();
  EXPECT_LT(allocatedBytes(), before + most);
  EXPECT_EQ(platform().inits, platform().quits);
}

}  // namespace
