#include <MW/dialog.h>
#include <MW/event_service.h>

#include <algorithm>
#include <array>
#include <climits>
#include <cmath>
#include <latch>
#include <thread>

#include <brimol3_widget_test/drawings.h>
#include "support/allocated_bytes.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Window;

using WindowTest = WidgetTest;

TEST_F(WindowTest, UnregisteringTakesTheFirstOfEqualIds) {
  std::string drawn;
  const JournalWidget a(drawn, 'a');
  JournalWidget b(drawn, 'b');
  const JournalWidget c(drawn, 'c');
  Window::unregisterWidget(&b);
  JournalWidget d(drawn, 'd');
  EXPECT_EQ(std::pair(c.id(), d.id()), std::pair(3, 3));
  EXPECT_EQ(JournalWidget(drawn, 'D', 0).id(), 1) << "layers are numbered apart";
  Window::unregisterWidget(&d);
  Window::show(1);
  EXPECT_EQ(drawn, "ad") << "c left in place of d";
}

// Places that were cleared cost every walk time, and memory.
TEST_F(WindowTest, WidgetsThatLeftTakeNoRoom) {
  platform().records = false;
  std::vector<std::unique_ptr<ProbeWidget>> all(4000);
  const std::size_t before = allocatedBytes();
  for (const bool byNumber : {true, false}) {
    for (auto& each : all) (each = std::make_unique<ProbeWidget>())->enter();
    for (auto& each : all) {
      if (byNumber) Window::unregisterWidget(each.get());
    }
    for (auto& each : all) each.reset();
    EXPECT_LT(allocatedBytes(), before + (std::size_t{1} << 13)) << byNumber;
  }
}

// Whose numbers are the same goes by itself all the same.
TEST_F(WindowTest, DeletingADialogTakesNoOtherAway) {
  MW::Dialog second(1);
  auto first = std::make_unique<MW::Dialog>(1);
  MW::Dialog third(1);
  first.reset();
  auto fourth = std::make_unique<MW::Dialog>(1);
  EXPECT_EQ(fourth->id(), third.id());
  platform().takeLog();
  fourth.reset();
  EXPECT_EQ(platform().takeLog().size(), 1U);
  third.setActive(1);
  Window::show(1);
  EXPECT_FALSE(platform().takeDrawings().empty());
}

TEST_F(WindowTest, RegistrationsAreCountedAndRefused) {
  std::string calls;
  const JournalWidget widget(calls, 'w');
  const std::vector<LogLine> entered = platform().takeLog();
  EXPECT_EQ(entered.at(0), logLines(kWarning, {"[WINDOW] registerWidget: type=1"})[0]);
  const std::string counted = "[WINDOW] registerWidget: num_widget=";
  const int count = std::stoi(entered.at(1).message.substr(counted.size()));
  EXPECT_EQ(entered.at(1), logLines(kDebug, {counted + std::to_string(count)})[0]);
  for (const int type : {-1, 2, INT_MIN}) {
    ProbeWidget stranger(type);
    stranger.enter();
    EXPECT_EQ(stranger.id(), 0);
    Window::unregisterWidget(&stranger);
  }
  const std::string left = "[WINDOW] unregisterWidget: num_widget=" + std::to_string(count - 3);
  EXPECT_EQ(platform().takeLog().back(), logLines(kDebug, {left})[0]) << "counted all the same";
  EXPECT_EQ(Window::registerWidget(nullptr) + Window::unregisterWidget(nullptr), 2);
}

TEST_F(WindowTest, DrawsAndTimesTheBaseLayerFirst) {
  std::string calls;
  const JournalWidget dialog(calls, 'D', 0);
  JournalWidget a(calls, 'a');
  JournalWidget hidden(calls, 'h');
  const JournalWidget b(calls, 'b');
  hidden.setActive(0);
  a.onShow = a.onTimer = [&](unsigned int ticks) { calls += std::to_string(ticks); };
  platform().ticks = 70;
  Window::show(5);
  Window::show();
  Window::updateTimer(5);
  EXPECT_EQ(calls, "5bD70bD70bD") << "the timer pass reads the clock";
}

TEST_F(WindowTest, TheFirstLooksAtTheScreensSizeMayMeet) {
  std::latch bothThere(2);
  const auto look = [&] {
    bothThere.arrive_and_wait();
    int width = 0;
    int height = 0;
    EXPECT_EQ(Window::getwindowsize(&width, &height), 1);
    EXPECT_EQ(std::pair(width, height), std::pair(1440, 2560));
  };
  { const std::array<std::jthread, 2> threads = {std::jthread(look), std::jthread(look)}; }
  EXPECT_EQ(std::pair(Window::width, Window::height), std::pair(1440, 2560)) << "it keeps them";
  setScreen(7, 0);
  Window::getwindowsize(nullptr, nullptr);
  EXPECT_EQ(std::pair(Window::width, Window::height), std::pair(1440, 2560)) << "there is no side";
}

const float densitiesAtStart = Window::xdpi + Window::ydpi;

TEST_F(WindowTest, TurnsMillimetresIntoPixels) {
  EXPECT_EQ(densitiesAtStart, 0) << "nobody has asked";
  using Pixels = std::pair<float, int>;  // the density as it is kept, and the length
  const auto pixels = [](float dpi, float mm) {
    Window::xdpi = 0;
    platform().xdpi = platform().ydpi = dpi;
    float told = 0;
    const int count = Window::getMura(&told, nullptr, mm);
    EXPECT_EQ(told, dpi) << "before it is rounded";
    EXPECT_EQ(Window::ydpi, dpi) << "only the horizontal density is rounded";
    return Pixels(Window::xdpi, count);
  };
  EXPECT_EQ(pixels(401.6F, 10), Pixels(402, 158));
  EXPECT_EQ(pixels(401.4F, 10), Pixels(401.4F, 158));
  EXPECT_EQ(pixels(100.5F, 254), Pixels(101, 1010));
  EXPECT_EQ(pixels(INFINITY, 10), Pixels(INFINITY, INT_MAX));
  EXPECT_EQ(pixels(-3e9F, 100), Pixels(-3e9F, INT_MIN));
  EXPECT_EQ(pixels(400, NAN), Pixels(400, 0));
  EXPECT_EQ(platform().takeLog()[0],
            logLines(kError, {"[WINDOW] getMura[402.000000 dpi] 10.000000mm = 158 pixel"})[0]);
}

TEST_F(WindowTest, LogsEventsOfFingersAndKeys) {
  const auto answered = [](int type) {
    MW::event_data event = {};
    event.type = type;
    const int answer = Window::onRecvEvent(&event, 0);
    std::string said = std::to_string(answer);
    for (const LogLine& line : platform().takeLog()) said += line.message;
    return said;
  };
  EXPECT_EQ(answered(MW::kEventMotion), "1[WINDOW] over!!");
  EXPECT_EQ(answered(MW::kEventPress), "1[WINDOW] pressed!!");
  EXPECT_EQ(answered(MW::kEventRelease), "1[WINDOW] released!!");
  EXPECT_EQ(answered(MW::kEventLongPress), "1[WINDOW] long pressed!!");
  EXPECT_EQ(answered(MW::kEventKeyPress), "1[WINDOW] key pressed!!");
  EXPECT_EQ(answered(MW::kEventKeyRelease), "1[WINDOW] key released!!");
  EXPECT_EQ(answered(MW::kEventUser), "0");
  EXPECT_EQ(Window::onRecvEvent(nullptr, 0), 0);
}

const LogLine kLeftOver = logLines(
    kError, {"[WINDOW] destroy: a handler asks for it: the rest is left to another call"})[0];
const LogLine kEnd = logLines(kError, {"[WINDOW] event_dispatcher End"})[0];

long countOf(const std::vector<LogLine>& lines, const LogLine& line) {
  return std::ranges::count(lines, line);
}

TEST_F(WindowTest, AnEndWithoutAStartIsLogged) {
  const LogLine refusal = logLines(kWarning, {"[WINDOW] destroy: it does not run"})[0];
  EXPECT_EQ(Window::destroy(), 1);
  EXPECT_EQ(platform().takeLog(), (std::vector{refusal, kEnd}));
  Window::init();
  Window::destroy();
  EXPECT_EQ(countOf(platform().takeLog(), refusal), 0);
  Window::destroy();
  EXPECT_EQ(countOf(platform().takeLog(), refusal), 1);
  EXPECT_EQ(std::pair(platform().inits, platform().quits), std::pair(1, 1));
}

TEST_F(WindowTest, StartsAndEndsOnAnyThreadsAtOnce) {
  for (int round = 0; round < 50; ++round) {
    ASSERT_EQ(Window::init(), 1);
    std::latch allThere(4);
    const auto meet = [&allThere](int (*operation)()) {
      allThere.arrive_and_wait();
      EXPECT_EQ(operation(), 1);
    };
    const std::array<std::jthread, 4> threads = {
        std::jthread(meet, &Window::destroy), std::jthread(meet, &Window::init),
        std::jthread(meet, &Window::destroy), std::jthread(meet, &Window::destroy)};
  }
  Window::destroy();
  EXPECT_EQ(Window::getEventService(), nullptr);
  EXPECT_EQ(platform().inits, platform().quits);
}

// The handler of a drawing pass that waited for the dispatch thread would wait for itself: there a
// callback deletes the handler's widget.
TEST_F(WindowTest, ADrawnHandlerThatEndsTheWindowDoesNotWait) {
  ASSERT_EQ(Window::init(), 1);
  std::latch bothInside(2);
  auto drawn = std::make_unique<ProbeWidget>();
  drawn->onShow = [&](unsigned int) {
    bothInside.arrive_and_wait();
    EXPECT_EQ(Window::destroy(), 1);
    EXPECT_EQ(Window::init(), 0) << "not before the end";
    EXPECT_NE(Window::getEventService(), nullptr);
  };
  drawn->enter();
  ProbeWidget offered;
  offered.onEvent = [&](auto*, auto) {
    bothInside.arrive_and_wait();
    drawn.reset();
    return true;
  };
  offered.enter();
  MW::EventService::AppEvent(1);
  Window::show(0);
  EXPECT_EQ(countOf(platform().takeLog(), kLeftOver), 1);
  EXPECT_EQ(Window::init(), 1) << "ends the rest, and starts anew";
  EXPECT_EQ(std::pair(platform().inits, platform().quits), std::pair(2, 1));
  Window::destroy();
  EXPECT_EQ(drawn, nullptr);
  EXPECT_EQ(Window::getEventService(), nullptr);
}

// The new dispatch thread begins after the handler that ends and starts the window.
TEST_F(WindowTest, ADispatchedHandlerEndsAndStartsTheWindow) {
  ASSERT_EQ(Window::init(), 1);
  std::string order;
  std::latch isOver(1);
  ProbeWidget widget;
  widget.onEvent = [&](const auto* event, auto) {
    order += std::to_string(event->value);
    if (event->value == 2) isOver.count_down();
    if (event->value == 2) return true;
    EXPECT_EQ(Window::destroy(), 1);
    EXPECT_EQ(Window::getEventService(), nullptr);
    EXPECT_EQ(Window::init(), 1);
    MW::EventService::AppEvent(2);
    for (int i = 0; i < 2000; ++i) std::this_thread::yield();
    order += "end";
    return true;
  };
  widget.enter();
  MW::EventService::AppEvent(1);
  isOver.wait();
  Window::destroy();
  EXPECT_EQ(order, "1end2");
  EXPECT_EQ(std::pair(platform().inits, platform().quits), std::pair(2, 2));
  const std::vector<LogLine> log = platform().takeLog();
  const LogLine later =
      logLines(kWarning, {"[WINDOW] destroy: a handler's thread ends after the handler"})[0];
  EXPECT_EQ(std::pair(countOf(log, kEnd), countOf(log, later)), std::pair(2L, 1L));
}

TEST_F(WindowTest, AnEndThatAHandlerAsksForDuringAStartIsNotLost) {
  ASSERT_EQ(Window::init(), 1);
  std::latch isEnding(1);
  ProbeWidget widget;
  widget.onEvent = [&](auto*, auto) {
    Window::destroy();
    isEnding.count_down();
    // The start has its turn once an end gets none.
    while (countOf(platform().takeLog(), kLeftOver) == 0) Window::destroy();
    return true;
  };
  widget.enter();
  MW::EventService::AppEvent(1);
  isEnding.wait();
  EXPECT_EQ(Window::init(), 1) << "waits for the handler";
  EXPECT_EQ(Window::getEventService(), nullptr);
  EXPECT_EQ(std::pair(platform().inits, platform().quits), std::pair(2, 2));
}

// An exit callback and the application's thread.
TEST_F(WindowTest, AHandlerEndsTheWindowWhileAnotherThreadDoes) {
  for (int round = 0; round < 50; ++round) {
    ASSERT_EQ(Window::init(), 1);
    std::latch bothThere(2);
    ProbeWidget widget;
    widget.onEvent = [&](auto*, auto) {
      bothThere.arrive_and_wait();
      return Window::destroy() == 1;
    };
    widget.enter();
    MW::EventService::AppEvent(1);
    bothThere.arrive_and_wait();
    Window::destroy();
    EXPECT_EQ(Window::getEventService(), nullptr);
  }
}

}  // namespace
