#include <MW/event_service.h>

#include <array>
#include <bit>
#include <climits>

#include "core/input_thread.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::event_data;
using MW::EventService;

using EventServiceTest = LiveWindowTest;

TEST(EventParseTest, FillsTheRecord) {
  Event event = {};
  for (std::size_t i = 0; i < sizeof event; ++i) event.bytes[i] = static_cast<uint8_t>(0xF0 + i);
  // The bytes are 0xF0 and up: unsigned ones stay so, and motion is negative.
  using Words = std::array<uint32_t, 7>;
  const auto parsed = [&event](uint8_t type) {
    event.type = type;
    event_data data = {.type = -1, .mouse = {9, 9, 9, 9, 9, 9}};
    EventService::parseEvent(&event, &data);
    return std::bit_cast<Words>(data);
  };
  EXPECT_EQ(parsed(4), (Words{0, 0xF3, 0xF2, 0xF5F4, 0xF7F6, 0U - 0x0608, 0U - 0x0406}));
  EXPECT_EQ(parsed(5), (Words{1, 0xF3, 0xF2, 0xF5F4, 0xF7F6}));
  EXPECT_EQ(parsed(6), (Words{2, 0xF3, 0xF2, 0xF5F4, 0xF7F6}));
  EXPECT_EQ(parsed(18), (Words{3, 0xF3, 0xF2, 0xF5F4, 0xF7F6}));
  EXPECT_EQ(parsed(2), (Words{4, 0xF2, 0xFBFAF9F8}));
  EXPECT_EQ(parsed(3), (Words{5, 0xF2, 0xFBFAF9F8}));
  EXPECT_EQ(parsed(24), (Words{7, 0xFBFAF9F8, 0xF7F6F5F4}));
  EXPECT_EQ(parsed(0), Words{8});
  EXPECT_EQ(parsed(255), Words{8});
  EventService::parseEvent(&event, nullptr);
}

TEST_F(EventServiceTest, EventsComeOutInTheirOrderInOneRecord) {
  EventService::AppEvent(-5);
  EventService::sendEvent(nullptr);
  EventService::saveQueue(nullptr);
  EventService::AppEvent(6);
  const event_data* const handedOut = EventService::recvEvent();
  EXPECT_EQ(handedOut->value, -5);
  EXPECT_EQ(EventService::recvEvent(), handedOut);
  EXPECT_EQ(handedOut->type, MW::kEventUnknown);
  EXPECT_EQ(EventService::recvEvent(), handedOut);
  EXPECT_EQ(EventService::recvEvent(), nullptr);
  EXPECT_EQ(handedOut->value, 6) << "an empty queue leaves the record";
}

TEST_F(EventServiceTest, InputThreadDrainsAtFullSpeedWhileThereIsAService) {
  const android::sp<MW::func_eventLoop> input = new MW::func_eventLoop;
  platform().takeLog();
  EXPECT_EQ(MW::Window::init(), 1);
  EXPECT_EQ(platform().takeLog(), logLines(kWarning, {"[WINDOW] init: it runs already"}));
  EXPECT_EQ(std::pair(platform().inits, platform().initFlags), std::pair(1, 0x01000001U));
  platform().feed(pointerInput(BRIMOL_POINTER_DOWN, {3, 4}));
  EXPECT_TRUE(input->threadLoop());
  EXPECT_NE(EventService::recvEvent(), nullptr);
  EXPECT_EQ(platform().paused, 0U);
  EXPECT_TRUE(input->threadLoop());
  EXPECT_EQ(platform().paused, 1U);
  LiveWindowTest::TearDown();
  platform().feed(pointerInput(BRIMOL_POINTER_DOWN, {3, 4}));
  EXPECT_TRUE(input->threadLoop());
  EXPECT_EQ(platform().takeLog().back(),
            logLines(kError, {"[EVENTSERVICE] eventLoop Window::getEventService FAIL 1!"})[0]);
}

// What is left in the queue is lost with its service, and so is what is posted from then on.
TEST_F(WidgetTest, EventsWithoutAServiceAreLostAndLogged) {
  {
    const EventService service;
    EXPECT_EQ(EventService::isActive(), 1);
    EventService::AppEvent(1);
  }
  EXPECT_EQ(EventService::isActive(), 0);
  platform().takeLog();
  EventService::AppEvent(2);
  EventService::sendEvent(nullptr);
  const std::string lost = "[EVENTSERVICE] saveQueue: no service runs, the event is lost";
  EXPECT_EQ(platform().takeLog(), logLines(kWarning, {lost, lost}));
  const EventService next;
  EXPECT_EQ(EventService::recvEvent(), nullptr);
}

// '#' is on the area, '+' around it.
std::string hits(std::initializer_list<Spot> spots, SKIA_Rect area = {100, 200, 50, 60, 0}) {
  std::string marks;
  for (const Spot& spot : spots) {
    const event_data event = pointerEvent(MW::kEventLongPress, spot, 3);
    const char off = EventService::isMouseEventAroundMe(&area, &event) ? '+' : '.';
    marks += EventService::isMouseEventForMe(&area, &event) ? '#' : off;
  }
  return marks;
}

TEST(EventHitTest, TestsThePoint) {
  EXPECT_EQ(hits({{79, 230}, {80, 230}, {99, 230}, {100, 230}}), ".++#");
  EXPECT_EQ(hits({{149, 230}, {150, 230}, {169, 230}, {170, 230}}), "#++.");
  EXPECT_EQ(hits({{120, 179}, {120, 180}, {120, 199}, {120, 200}}), ".++#");
  EXPECT_EQ(hits({{120, 259}, {120, 260}, {120, 279}, {120, 280}}), "#++.");
  EXPECT_EQ(hits({{165, 275}, {85, 185}}), "..") << "beside a corner";
  EXPECT_EQ(hits({{100, 230}, {80, 230}}, {100, 200, 0, 60, 0}), "..");
  EXPECT_EQ(hits({{100, 230}, {80, 230}}, {100, 200, -50, 60, 0}), "..");
  EXPECT_EQ(hits({{120, 230}, {121, 230}, {120, 229}}, {120, 230, 1, 1, 0}), "#..");
  constexpr int kMin = INT_MIN;
  constexpr int kMax = INT_MAX;
  EXPECT_EQ(hits({{kMin, kMin}, {-2, -2}, {0, kMax}}, {kMin, kMin, kMax, kMax, 0}), "##.");
  EXPECT_EQ(hits({{kMax, kMax}, {0, 0}}, {kMax - 5, kMax - 5, kMax, kMax, 0}), "#.");
}

TEST(EventHitTest, OnlyPointersAreSomewhere) {
  const SKIA_Rect area = {0, 0, 9, 9, 0};
  for (int code = 0; code <= 8; ++code) {
    const event_data event = {.type = code, .mouse = {}};
    EXPECT_EQ(EventService::isMouseEventForMe(&area, &event), code < 4) << code;
    EXPECT_EQ(EventService::isMouseEventAroundMe(&area, &event), code < 4) << code;
    EXPECT_EQ(MW::isFirstFinger(&event), code < 4) << code;
  }
  EXPECT_FALSE(EventService::isMouseEventForMe(&area, nullptr));
  EXPECT_FALSE(EventService::isMouseEventAroundMe(nullptr, nullptr));
}

}  // namespace
