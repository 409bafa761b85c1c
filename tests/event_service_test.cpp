#include <MW/event_service.h>
#include <MW/window.h>

#include <array>
#include <bit>
#include <cctype>
#include <climits>
#include <memory>
#include <utility>

#include "core/dispatch_thread.h"
#include "core/input_thread.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::event_data;
using MW::EventService;

// The test's own threads of input and dispatch take a round when it says so.
class EventServiceTest : public LiveWindowTest {
 protected:
  static EventService& service() { return *MW::Window::getEventService(); }
  void dispatchOne() {
    EXPECT_TRUE(dispatcher->threadLoop());
    EXPECT_EQ(std::exchange(platform().paused, 0), 1U);
  }

  const android::sp<MW::func_dispatchEvent> dispatcher = new MW::func_dispatchEvent;
  const android::sp<MW::func_eventLoop> input = new MW::func_eventLoop;
};

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
  service().AppEvent(-5);
  service().sendEvent(nullptr);
  service().saveQueue(nullptr);
  service().AppEvent(6);
  const event_data* const handedOut = service().recvEvent();
  EXPECT_EQ(handedOut->value, -5);
  EXPECT_EQ(service().recvEvent(), handedOut);
  EXPECT_EQ(handedOut->type, MW::kEventUnknown);
  EXPECT_EQ(service().recvEvent(), handedOut);
  EXPECT_EQ(service().recvEvent(), nullptr);
  EXPECT_EQ(handedOut->value, 6) << "an empty queue leaves the record";
}

TEST_F(EventServiceTest, InputThreadDrainsAtFullSpeed) {
  for (const unsigned int paused : {0U, 0U, 1U}) {
    if (paused == 0) platform().feed(pointerInput(BRIMOL_POINTER_DOWN, {3, 4}));
    EXPECT_TRUE(input->threadLoop());
    EXPECT_EQ(platform().paused, paused);
    EXPECT_EQ(service().recvEvent() == nullptr, paused == 1);
  }
}

TEST_F(EventServiceTest, WindowStartsAndStopsInput) {
  EXPECT_EQ(MW::Window::init(), 1) << "runs already";
  EXPECT_EQ(service().isActive(), 1);
  EXPECT_EQ(platform().inits, 1);
  EXPECT_EQ(platform().initFlags, 0x01000001U);
  LiveWindowTest::TearDown();
  EXPECT_EQ(platform().quits, 1);
  EXPECT_EQ(MW::Window::getEventService(), nullptr);
  platform().feed(pointerInput(BRIMOL_POINTER_DOWN, {3, 4}));
  platform().takeLog();
  EXPECT_TRUE(input->threadLoop());
  EXPECT_EQ(platform().takeLog().back(),
            logLines(kError, {"[EVENTSERVICE] eventLoop Window::getEventService FAIL 1!"})[0]);
}

struct RouteCase {
  // In the order of registering. Capitals stand in the top layer; t, x and h take what they are
  // offered, s, x and i are selected, h and i are hidden, w is none of it.
  const char* members;
  const char* offered;
  int live, redraw;
  int asked;  // how often the display was asked whether it is live
};

TEST_F(EventServiceTest, AnEventIsOfferedByTheRules) {
  for (const RouteCase& row : std::vector<RouteCase>{{"", "", 1, 0, 0},
                                                     {"ww", "ww", 1, 0, 1},
                                                     {"wtw", "wt", 1, 1, 1},
                                                     {"t", "", 0, 0, 1},
                                                     {"tH", "", 0, 0, 1},
                                                     {"hw", "w", 1, 0, 1},
                                                     {"tW", "W", 1, 0, 1},
                                                     {"tWTW", "WT", 1, 1, 1},
                                                     {"tIH", "t", 1, 1, 2},
                                                     {"tHW", "W", 1, 0, 1},
                                                     {"ws", "sws", 1, 0, 1},
                                                     {"tsxs", "sx", 1, 1, 1},
                                                     {"iw", "iw", 1, 0, 1},
                                                     {"WX", "WX", 1, 1, 1}}) {
    SCOPED_TRACE(row.members);
    std::string offered;
    std::vector<std::unique_ptr<JournalWidget>> widgets;
    for (const char* member = row.members; *member != 0; ++member) {
      const std::string letter(1, static_cast<char>(std::tolower(*member)));
      const bool takes = letter.find_first_of("txh") == 0;
      const int layer = std::isupper(*member) != 0 ? 0 : 1;
      widgets.push_back(std::make_unique<JournalWidget>(offered, *member, layer, takes));
      widgets.back()->setActive(letter.find_first_not_of("hi") == 0 ? 1 : 0);
      widgets.back()->setSelect(letter.find_first_of("sxi") == 0 ? 1 : 0);
    }
    platform().live = row.live;
    platform().liveAsked = 0;
    service().AppEvent(1);
    dispatchOne();
    EXPECT_EQ(offered, row.offered);
    EXPECT_EQ(MW::isDisplayUpdate(0), row.redraw);
    EXPECT_EQ(platform().liveAsked, row.asked);
  }
}

// A handler deletes a neighbour and its own widget, in either pass, and adds another.
TEST_F(EventServiceTest, HandlersMayChangeTheLayers) {
  for (const int selected : {0, 1}) {
    std::string offered;
    auto a = std::make_unique<JournalWidget>(offered, 'a');
    auto b = std::make_unique<JournalWidget>(offered, 'b');
    const JournalWidget c(offered, 'c');
    std::unique_ptr<JournalWidget> d;
    a->setSelect(selected);
    a->onEvent = [&](const event_data* event, unsigned int arg) {
      EXPECT_EQ(std::pair(event->value, arg), std::pair(7, 0U));
      b.reset();
      d = std::make_unique<JournalWidget>(offered, 'd');
      a.reset();
      return false;
    };
    service().AppEvent(7);
    dispatchOne();
    EXPECT_EQ(offered, selected != 0 ? "cd" : "c");
  }
}

// '#' is on the area, '+' around it.
std::string hits(std::initializer_list<Spot> spots, SKIA_Rect area = {100, 200, 50, 60, 0}) {
  std::string marks;
  for (const Spot& spot : spots) {
    const event_data event = pointerEvent(MW::kEventLongPress, spot, 3);
    const bool isOn = EventService::isMouseEventForMe(&area, &event);
    const bool isAround = EventService::isMouseEventAroundMe(&area, &event);
    marks += isOn && isAround ? '#' : isAround ? '+' : isOn ? '!' : '.';
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
  EXPECT_EQ(hits({{INT_MIN, INT_MIN}, {-2, -2}, {INT_MAX, INT_MAX}},
                 {INT_MIN, INT_MIN, INT_MAX, INT_MAX, 0}),
            "##.");
  EXPECT_EQ(hits({{INT_MAX, INT_MAX}, {0, 0}}, {INT_MAX - 5, INT_MAX - 5, INT_MAX, INT_MAX, 0}),
            "#.");
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
