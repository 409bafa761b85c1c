// What waits for input records or for the time, and how long.
#include "input/input_service.h"

#include <gmock/gmock.h>

#include <atomic>
#include <latch>
#include <thread>

#include "input/event_records.h"
#include "pc/support/record_text.h"

namespace brimol::pc {
namespace {

using std::chrono::milliseconds;
using std::chrono::steady_clock;
using testing::ElementsAre;

constexpr uint32_t kForeverMs = 120'000;  // longer than a test may take
const Event kKeyDown = keyRecord(BRIMOL_KEY_DOWN, 273);
const Event kKeyUp = keyRecord(BRIMOL_KEY_UP, 273);

TEST(InputService, TakesABoundedNumberOfRecordsWhileOpen) {
  InputService service;
  service.post(kKeyDown);
  service.open();
  EXPECT_EQ(takeTexts(service).size(), 0U);
  for (int i = 0; i < 5000; ++i) service.post(kKeyDown);
  EXPECT_EQ(takeTexts(service).size(), InputQueue::kCapacity);
  service.post(kKeyDown);
  service.close();
  service.open();
  service.post(kKeyUp);
  service.delay(kForeverMs);  // over at once: this thread polls, and a record waits
  EXPECT_THAT(takeTexts(service), ElementsAre("key up 273"));
  EXPECT_EQ(PollEvent(nullptr), 0);
}

void takeOne(InputService& service) {
  for (Event record = {}; !service.poll(record);) service.delay(kForeverMs);
}

TEST(InputService, PausesLongerWhereNothingHappensForASecond) {
  InputService service;
  const auto lasts = [&service](steady_clock::time_point start, uint32_t ms) {
    return service.endOfPause(start, ms) - start;
  };
  const auto before = steady_clock::now();
  service.open();
  for (const bool draws : {true, false}) {
    EXPECT_EQ(lasts(before + milliseconds(999), 1), milliseconds(1));
    const auto idle = steady_clock::now() + InputService::kIdleAfter;
    EXPECT_EQ(lasts(idle, 1), milliseconds(4));
    EXPECT_EQ(lasts(idle, 2), milliseconds(2))
        << "only who looks for work without end waits longer";
    draws ? service.hearOfFrame() : service.post(kKeyDown);
    EXPECT_EQ(lasts(idle, 1), milliseconds(1)) << draws;
  }
}

TEST(InputService, LosesNoWakeUp) {
  InputService service;
  service.open();
  std::atomic<uint32_t> taken = 0;
  std::thread poller([&] {
    for (int i = 0; i < 3000; ++i) {
      takeOne(service);
      ++taken;
      taken.notify_one();
    }
  });
  for (uint32_t posted = 0; posted < 3000; ++posted) {
    service.post(kKeyDown);
    taken.wait(posted);
  }
  poller.join();
}

TEST(InputService, PausesUntilTheRealTimeOrTheHandReachesIt) {
  InputService service;
  service.open();
  service.post(kKeyDown);
  const auto before = steady_clock::now();
  service.delay(20);
  EXPECT_GE(steady_clock::now() - before, milliseconds(20)) << "this thread does not poll";
  service.takeHand(0xFFFFFFF0);  // wraps soon
  std::atomic<uint32_t> lasted = 0;
  std::thread pausing([&] {
    const uint32_t start = service.now();
    service.delay(100);
    lasted = service.now() - start;
  });
  while (lasted == 0) service.advance(7);
  pausing.join();
  EXPECT_GE(lasted, 100U);
}

TEST(InputService, LeavesNobodyWaitingAndTheTimeWhereItIsWhenItCloses) {
  InputService service;
  std::vector<uint32_t> times;
  service.setTimeWatcher([&] { times.push_back(service.now()); });
  service.takeHand(5000);
  service.advance(250);
  service.setTimeWatcher({});
  EXPECT_THAT(times, ElementsAre(5000U, 5250U));
  for (int round = 0; round < 100; ++round) {
    std::latch started(1);
    std::thread waiter([&] {
      started.count_down();
      service.delay(1);  // by hand, or real when the close is faster
    });
    started.wait();
    service.close();
    waiter.join();
    EXPECT_LT(service.now() - 5250U, kForeverMs);
    service.takeHand(5250);
  }
}

}  // namespace
}  // namespace brimol::pc
