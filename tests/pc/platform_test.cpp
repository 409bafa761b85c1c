#include "platform.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <atomic>
#include <latch>
#include <thread>

#include "painting.h"
#include "record_text.h"

namespace brimol::pc {
namespace {

using std::chrono::milliseconds;
using std::chrono::seconds;
using testing::ElementsAre;

constexpr Size kScreen = {200, 300};
constexpr seconds kLong{60};  // longer than anything takes here

Frame filledWith(std::uint32_t colour) { return {boxItem({0, 0, kScreen.w, kScreen.h, colour})}; }

/// The colour in the middle.
std::uint32_t colourOf(const CairoSurface& picture) {
  return picture ? kBlack | pictureOf(picture.get()).at(kScreen.w / 2, kScreen.h / 2) : 0;
}

class PlatformTest : public testing::Test {
 protected:
  PlatformTest() {
    service.open();
    std::string error;
    platform = Platform::open({DisplayChoice::Headless, kScreen}, service, error);
  }
  ~PlatformTest() override {
    if (!release.try_wait()) release.count_down();
    platform->close();
  }

  /// Returns once the thread has done what it was told, and has looked at the time after that.
  void settle() {
    platform->copyPicture(kLong);
    platform->copyPicture(kLong);
  }

  /// Keeps the platform's thread busy until `release` counts down.
  void keepBusy() {
    std::latch begun(1);
    platform->act([this, &begun](InputTranslator&) {
      begun.count_down();
      release.wait();
    });
    begun.wait();
  }

  InputService service;
  std::shared_ptr<Platform> platform;
  std::latch release{1};
};

TEST_F(PlatformTest, ShowsTheNewestFrame) {
  EXPECT_EQ(colourOf(platform->copyPicture(kLong)), kBlack) << "before any frame";
  platform->submit(filledWith(kRed));
  EXPECT_EQ(colourOf(platform->copyPicture(kLong)), kRed);
  keepBusy();
  platform->submit(filledWith(kBlue));
  platform->submit(filledWith(kRed));
  platform->submit(filledWith(kBlue));
  release.count_down();
  EXPECT_EQ(colourOf(platform->copyPicture(kLong)), kBlue);
}

TEST_F(PlatformTest, NeverKeepsASubmitterWaiting) {
  keepBusy();
  for (int i = 0; i < 1000; ++i) platform->submit(filledWith(kRed));
  EXPECT_EQ(platform->copyPicture(milliseconds(1)), nullptr) << "the thread is busy";
  release.count_down();
  EXPECT_EQ(colourOf(platform->copyPicture(kLong)), kRed);
}

TEST_F(PlatformTest, AnswersWhoWaitsForAPictureAsItCloses) {
  keepBusy();
  std::latch asked(1);
  std::thread waiter([&] {
    asked.count_down();
    EXPECT_EQ(platform->copyPicture(kLong), nullptr);
  });
  asked.wait();
  std::thread closer([&] { platform->close(); });
  const auto notAnyMore = [](InputTranslator&) { ADD_FAILURE() << "done though it closes"; };
  while (platform->act(notAnyMore)) std::this_thread::yield();
  release.count_down();
  closer.join();
  waiter.join();
  platform->submit(filledWith(kRed));
  EXPECT_EQ(platform->copyPicture(kLong), nullptr) << "closed";
}

TEST_F(PlatformTest, ReportsALongPressWhenItsTimeComes) {
  service.takeHand(1000);
  platform->act([](InputTranslator& input) { input.pointerDown(kMouse, {10, 20}, 1000); });
  service.advance(499);
  settle();
  EXPECT_THAT(takeTexts(service), ElementsAre("down 0 at 10,20"));
  service.advance(1);
  settle();
  EXPECT_THAT(takeTexts(service), ElementsAre("long 0 at 10,20"));
}

TEST_F(PlatformTest, WakesUpForALongPressByItself) {
  platform->act([this](InputTranslator& input) {
    input.pointerDown(kMouse, {10, 20}, service.now() - LongPress::kHoldMs + 1);
  });
  Event record = {};
  while (record.type != BRIMOL_LONG_PRESS) {
    if (!service.poll(record)) service.delay(60'000);
  }
  EXPECT_EQ(textOf(record), "long 0 at 10,20");
}

TEST_F(PlatformTest, ClosesWhileFramesAndActionsArrive) {
  std::atomic<bool> isOver = false;
  std::thread submitter([&] {
    while (!isOver) platform->submit(filledWith(kRed));
  });
  std::thread actor([&] {
    while (!isOver) platform->act([](InputTranslator& input) { input.releaseAll(); });
  });
  std::thread clockHand([&] {
    while (!isOver) service.advance(1);
  });
  EXPECT_NE(platform->copyPicture(kLong), nullptr);
  platform->close();
  platform->close();
  isOver = true;
  submitter.join();
  actor.join();
  clockHand.join();
}

}  // namespace
}  // namespace brimol::pc
