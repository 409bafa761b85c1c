#include "input/input_service.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <atomic>
#include <latch>
#include <thread>

#include "input/event_records.h"
#include "record_text.h"

namespace brimol::pc {
namespace {

using std::chrono::seconds;
using std::chrono::steady_clock;

constexpr uint32_t kForeverMs = 120'000;  // longer than a test may take
constexpr uint32_t kKey = 273;
const Event kRecord = keyRecord(BRIMOL_KEY_DOWN, kKey);

TEST(InputService, TakesRecordsOnlyWhileOpen) {
  InputService service;
  service.post(kRecord);
  EXPECT_THAT(takeTexts(service), testing::IsEmpty());
  service.open();
  service.post(kRecord);
  service.close();
  EXPECT_THAT(takeTexts(service), testing::IsEmpty());
  service.open();
  service.post(kRecord);
  EXPECT_THAT(takeTexts(service), testing::ElementsAre("key down 273"));
}

TEST(InputService, EndsThePollersPauseForARecordThatCameBefore) {
  InputService service;
  service.open();
  Event record = {};
  EXPECT_FALSE(service.poll(record));
  service.post(kRecord);
  const auto start = steady_clock::now();
  service.delay(kForeverMs);
  EXPECT_LT(steady_clock::now() - start, seconds(kForeverMs / 2000));
  EXPECT_TRUE(service.poll(record));
}

void takeRecords(InputService& service, uint32_t count, std::atomic<uint32_t>& taken) {
  while (taken < count) {
    Event record = {};
    if (!service.poll(record)) {
      service.delay(kForeverMs);
      continue;
    }
    ++taken;
    taken.notify_one();
  }
}

TEST(InputService, LosesNoWakeUp) {
  constexpr uint32_t kRecords = 3000;
  InputService service;
  service.open();
  std::atomic<uint32_t> taken = 0;
  std::thread poller([&] { takeRecords(service, kRecords, taken); });
  const auto start = steady_clock::now();
  for (uint32_t posted = 0; posted < kRecords; ++posted) {
    service.post(kRecord);
    taken.wait(posted);
  }
  poller.join();
  EXPECT_LT(steady_clock::now() - start, seconds(kForeverMs / 2000));
}

TEST(InputService, PausesOtherThreadsForTheirWholeTime) {
  constexpr uint32_t kMs = 20;
  InputService service;
  service.open();
  service.post(kRecord);
  const auto start = steady_clock::now();
  const uint32_t startTicks = service.now();
  service.delay(kMs);
  EXPECT_GE(steady_clock::now() - start, std::chrono::milliseconds(kMs));
  EXPECT_GE(service.now() - startTicks, kMs);
}

TEST(InputService, PausesUntilTheHandReachesTheTime) {
  constexpr uint32_t kNearlyWrapped = 0xFFFFFFF0;
  InputService service;
  service.takeHand(kNearlyWrapped);
  std::atomic<bool> ended = false;
  uint32_t lasted = 0;
  std::thread pausing([&] {
    const uint32_t start = service.now();
    service.delay(100);
    lasted = service.now() - start;
    ended = true;
  });
  while (!ended) service.advance(7);
  pausing.join();
  EXPECT_GE(lasted, 100u);
}

TEST(InputService, LeavesNobodyWaitingWhenItCloses) {
  InputService service;
  service.open();
  service.takeHand(0);
  std::latch started(2);
  const auto pause = [&] {
    Event record = {};
    service.poll(record);
    started.count_down();
    service.delay(1);  // by hand, or real when the close was faster
  };
  std::thread one(pause);
  std::thread other(pause);
  started.wait();
  service.close();
  one.join();
  other.join();
  service.advance(kForeverMs);
  EXPECT_LT(service.now(), kForeverMs) << "the clock is still by hand";
}

TEST(InputService, GoesOnFromWhereTheHandLeftIt) {
  InputService service;
  service.takeHand(5000);
  EXPECT_EQ(service.now(), 5000u);
  service.advance(250);
  EXPECT_EQ(service.now(), 5250u);
  service.letGo();
  EXPECT_LT(service.now() - 5250u, kForeverMs);
  service.advance(kForeverMs);
  EXPECT_LT(service.now() - 5250u, kForeverMs);
}

TEST(InputService, TellsTheWatcherThatTimeMoved) {
  InputService service;
  std::vector<uint32_t> times;
  service.setTimeWatcher([&] { times.push_back(service.now()); });
  service.takeHand(10);
  service.advance(5);
  service.setTimeWatcher({});
  service.advance(5);
  EXPECT_THAT(times, testing::ElementsAre(10u, 15u));
}

TEST(InputCalls, PollNothingIntoANullRecord) {
  EXPECT_EQ(PollEvent(nullptr), 0);
  inputService().takeHand(42);
  EXPECT_EQ(GetTicks(), 42u);
  inputService().letGo();
}

}  // namespace
}  // namespace brimol::pc
