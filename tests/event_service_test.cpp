#include <MW/event_service.h>
#include <MW/window.h>

#include <array>
#include <bit>
#include <limits>
#include <thread>

#include "core/input_thread.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::event_data;
using MW::EventService;

constexpr int kMax = std::numeric_limits<int>::max();
constexpr int kMin = std::numeric_limits<int>::min();

class EventServiceTest : public LiveWindowTest {
 protected:
  static EventService& service() { return *MW::Window::getEventService(); }

  // The type of every event that is queued, and 6's value.
  static std::vector<std::pair<int, int>> drain() {
    std::vector<std::pair<int, int>> events;
    while (const event_data* event = service().recvEvent()) {
      events.emplace_back(event->type, event->type == MW::kEventApplication ? event->value : 0);
    }
    return events;
  }
};

struct ParseCase : Row {
  uint8_t type;
  std::vector<uint32_t> words;  // those of event_data that the type fills
};

class EventParse : public testing::TestWithParam<ParseCase> {};

TEST_P(EventParse, FillsTheRecord) {
  Event event = {};
  for (std::size_t i = 0; i < sizeof event; ++i) event.bytes[i] = static_cast<uint8_t>(0xF0 + i);
  event.type = GetParam().type;
  event_data data = {.type = -1, .mouse = {9, 9, 9, 9, 9, 9}};
  EventService::parseEvent(&event, &data);
  const auto words = std::bit_cast<std::array<uint32_t, 7>>(data);
  for (std::size_t i = 0; i < GetParam().words.size(); ++i) {
    EXPECT_EQ(words.at(i), GetParam().words[i]) << "word " << i + 1;
  }
}

// The record's bytes are 0xF0 and up: unsigned ones stay so, and motion is negative.
constexpr auto kXMotion = static_cast<uint32_t>(-0x0608);
constexpr auto kYMotion = static_cast<uint32_t>(-0x0406);
INSTANTIATE_TEST_SUITE_P(
    Types, EventParse,
    testing::Values(ParseCase{"Motion", 4, {0, 0xF3, 0xF2, 0xF5F4, 0xF7F6, kXMotion, kYMotion}},
                    ParseCase{"Down", 5, {1, 0xF3, 0xF2, 0xF5F4, 0xF7F6, 0, 0}},
                    ParseCase{"Up", 6, {2, 0xF3, 0xF2, 0xF5F4, 0xF7F6, 0, 0}},
                    ParseCase{"LongPress", 18, {3, 0xF3, 0xF2, 0xF5F4, 0xF7F6, 0, 0}},
                    ParseCase{"KeyDown", 2, {4, 0xF2, 0xFBFAF9F8}},
                    ParseCase{"KeyUp", 3, {5, 0xF2, 0xFBFAF9F8}},
                    ParseCase{"User", 24, {7, 0xFBFAF9F8, 0xF7F6F5F4}},
                    ParseCase{"Unlisted", 7, {8, 0, 0}}, ParseCase{"UnlistedZero", 0, {8, 0, 0}},
                    ParseCase{"UnlistedHighest", 255, {8, 0, 0}}),
    kRowName);

TEST(EventParseTest, NullRecordsAreNoInput) {
  event_data data = {.type = 3, .value = 4};
  EventService::parseEvent(nullptr, &data);
  EXPECT_EQ(data.type, MW::kEventUnknown);
  const Event event = pointerInput(BRIMOL_POINTER_DOWN, {1, 2});
  EventService::parseEvent(&event, nullptr);
}

TEST_F(EventServiceTest, EventsComeOutInTheirOrder) {
  EXPECT_EQ(service().recvEvent(), nullptr);
  const Event input = pointerInput(BRIMOL_POINTER_UP, {3, 4});
  service().AppEvent(-5);
  service().sendEvent(&input);
  service().sendEvent(nullptr);
  service().saveQueue(nullptr);
  service().AppEvent(6);
  using Events = std::vector<std::pair<int, int>>;
  EXPECT_EQ(drain(), (Events{{6, -5}, {2, 0}, {8, 0}, {6, 6}}));
  EXPECT_EQ(service().recvEvent(), nullptr);
}

TEST_F(EventServiceTest, HandsEventsOutInOneRecord) {
  service().AppEvent(1);
  service().AppEvent(2);
  const event_data* const handedOut = service().recvEvent();
  EXPECT_EQ(handedOut->value, 1);
  EXPECT_EQ(service().recvEvent(), handedOut);
  EXPECT_EQ(handedOut->value, 2);
  EXPECT_EQ(service().recvEvent(), nullptr);
  EXPECT_EQ(handedOut->value, 2) << "an empty queue leaves the record";
}

TEST_F(EventServiceTest, TwoProducersKeepTheirOrders) {
  constexpr int kEvents = 2000;
  const auto produce = [](int first) {
    for (int i = 0; i < kEvents; ++i) service().AppEvent(first + i);
  };
  std::thread other(produce, kEvents);
  produce(0);
  other.join();
  std::array<int, 2> next = {0, kEvents};
  for (const auto& [type, value] : drain()) EXPECT_EQ(value, next.at(value < kEvents ? 0 : 1)++);
  EXPECT_EQ(next, (std::array{kEvents, 2 * kEvents}));
}

TEST_F(EventServiceTest, InputThreadDrainsAtFullSpeed) {
  const android::sp<MW::func_eventLoop> loop = new MW::func_eventLoop;
  platform().feed(pointerInput(BRIMOL_POINTER_DOWN, {3, 4}));
  platform().feed(pointerInput(BRIMOL_POINTER_UP, {3, 4}));
  EXPECT_TRUE(loop->threadLoop());
  EXPECT_TRUE(loop->threadLoop());
  EXPECT_TRUE(platform().takeDelays().empty());
  EXPECT_TRUE(loop->threadLoop());
  EXPECT_EQ(platform().takeDelays(), std::vector{1U});
  EXPECT_EQ(drain().size(), 2U);
}

TEST_F(WidgetTest, InputWithoutAServiceIsLost) {
  const android::sp<MW::func_eventLoop> loop = new MW::func_eventLoop;
  platform().feed(pointerInput(BRIMOL_POINTER_DOWN, {3, 4}));
  EXPECT_TRUE(loop->threadLoop());
  loop->requestExit();
  loop->threadLoop();
  const std::vector<LogLine> log = platform().takeLog();
  ASSERT_EQ(log.size(), 3U);
  EXPECT_EQ(log[0], logLines(kDebug, {"[EVENTSERVICE] func_eventLoop start!"})[0]);
  EXPECT_EQ(log[1],
            logLines(kError, {"[EVENTSERVICE] eventLoop Window::getEventService FAIL 1!"})[0]);
  EXPECT_EQ(log[2],
            logLines(kDebug, {"[EVENTSERVICE] func_eventLoop->threadLoop exitPending: 1"})[0]);
}

TEST_F(WidgetTest, WindowStartsAndStopsInput) {
  platform().setPauses(Pauses::Parked);
  EXPECT_EQ(MW::Window::getEventService(), nullptr);
  EXPECT_EQ(MW::Window::init(), 1);
  platform().awaitParked(2);
  std::vector<LogLine> log = platform().takeLog();
  // Threads of a test before this one may still be on their way out.
  std::erase_if(log, [](const LogLine& line) { return line.message.ends_with("destory!"); });
  EXPECT_EQ(log, logLines(kDebug, {"[EVENTSERVICE] startEvent->EventInit",
                                   "[EVENTSERVICE] func_eventLoop start!",
                                   "[EVENTSERVICE] startEvent (threadLoop)",
                                   "[WINDOW] func_dispatchEvent start!"}));
  EventService* const service = MW::Window::getEventService();
  EXPECT_EQ(MW::Window::init(), 1) << "runs already";
  EXPECT_EQ(MW::Window::getEventService(), service);
  EXPECT_EQ(service->isActive(), 1);
  EXPECT_EQ(platform().inits, 1);
  EXPECT_EQ(platform().initFlags, 0x01000001U);
  platform().setPauses(Pauses::Short);
  MW::Window::destroy();
  EXPECT_EQ(MW::Window::getEventService(), nullptr);
  EXPECT_EQ(platform().quits, 1);
  // Lines at error level: those of the ending threads come when they come.
  log = platform().takeLog();
  std::erase_if(log, [](const LogLine& line) { return line.priority != kError; });
  EXPECT_EQ(log,
            logLines(kError, {"[EVENTSERVICE] stopEvent End", "[WINDOW] event_dispatcher End"}));
}

struct HitCase : Row {
  SKIA_Rect area;
  Spot spot;
  bool forMe, aroundMe;
};

class EventHit : public testing::TestWithParam<HitCase> {};

TEST_P(EventHit, TestsThePoint) {
  const HitCase& row = GetParam();
  const event_data event = pointerEvent(MW::kEventLongPress, row.spot, 3);
  EXPECT_EQ(EventService::isMouseEventForMe(&row.area, &event), row.forMe);
  EXPECT_EQ(EventService::isMouseEventAroundMe(&row.area, &event), row.aroundMe);
}

constexpr SKIA_Rect kArea = {100, 200, 50, 60, 0};
constexpr SKIA_Rect kEverything = {kMin, kMin, kMax, kMax, 0};
INSTANTIATE_TEST_SUITE_P(
    Points, EventHit,
    testing::Values(
        HitCase{"TopLeft", kArea, {100, 200}, true, true},
        HitCase{"BottomRight", kArea, {149, 259}, true, true},
        HitCase{"RightEdge", kArea, {150, 230}, false, true},
        HitCase{"BottomEdge", kArea, {120, 260}, false, true},
        HitCase{"LeftOf", kArea, {80, 230}, false, true},
        HitCase{"TooFarLeft", kArea, {79, 230}, false, false},
        HitCase{"RightOf", kArea, {169, 230}, false, true},
        HitCase{"TooFarRight", kArea, {170, 230}, false, false},
        HitCase{"Above", kArea, {120, 180}, false, true},
        HitCase{"TooFarAbove", kArea, {120, 179}, false, false},
        HitCase{"TooFarBelow", kArea, {120, 280}, false, false},
        HitCase{"BesideTheCorner", kArea, {165, 275}, false, false},
        HitCase{"OverANarrowStrip", {100, 200, 5, 5, 0}, {90, 202}, false, false},
        HitCase{"Empty", {100, 200, 0, 60, 0}, {100, 230}, false, false},
        HitCase{"Negative", {100, 200, -50, 60, 0}, {80, 230}, false, false},
        HitCase{"Lowest", kEverything, {kMin, kMin}, true, true},
        HitCase{"JustBelowZero", kEverything, {-2, -2}, true, true},
        HitCase{"Highest", kEverything, {kMax, kMax}, false, false},
        HitCase{"WideAtTheEnd", {kMax - 5, kMax - 5, kMax, kMax, 0}, {kMax, kMax}, true, true}),
    kRowName);

TEST(EventHitTest, OnlyPointersAreSomewhere) {
  for (int code = 0; code <= 8; ++code) {
    const event_data event = {.type = code, .mouse = {0, 0, 110, 210, 0, 0}};
    EXPECT_EQ(EventService::isMouseEventForMe(&kArea, &event), code < 4) << code;
    EXPECT_EQ(EventService::isMouseEventAroundMe(&kArea, &event), code < 4) << code;
  }
  const event_data event = pointerEvent(MW::kEventPress, {110, 210});
  EXPECT_FALSE(EventService::isMouseEventForMe(nullptr, &event));
  EXPECT_FALSE(EventService::isMouseEventForMe(&kArea, nullptr));
  EXPECT_FALSE(EventService::isMouseEventAroundMe(nullptr, &event));
  EXPECT_FALSE(EventService::isMouseEventAroundMe(&kArea, nullptr));
}

TEST(FirstFingerTest, IsFingerZeroOfAPointer) {
  for (int code = 0; code <= 8; ++code) {
    event_data event = {.type = code, .mouse = {}};
    EXPECT_EQ(MW::isFirstFinger(&event), code < 4) << code;
    event.mouse.finger = 1;
    EXPECT_FALSE(MW::isFirstFinger(&event)) << code;
  }
  EXPECT_FALSE(MW::isFirstFinger(nullptr));
}

}  // namespace
