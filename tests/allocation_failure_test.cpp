// What the toolkit does where there is no memory. No failure may throw, crash, leak or change more
// than the operation that failed.

#include <MW/button.h>
#include <MW/event_service.h>
#include <MW/primitives.h>
#include <MW/widget_list.h>
#include <MW/window.h>

#include <memory>

#include "core/dispatch_thread.h"
#include "support/failing_malloc.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::EventService;
using MW::WidgetList;
using MW::Window;

constexpr int kEnough = 1000;  // allocations; no operation here makes so many

class AllocationTest : public LiveWindowTest {
 protected:
  static EventService& service() { return *Window::getEventService(); }
};

struct LossCase : Row {
  void (*queue)(EventService&);
  int nth;
  const char* line;
};

class EventLoss : public AllocationTest, public testing::WithParamInterface<LossCase> {};

TEST_P(EventLoss, IsLoggedAndChangesNothingElse) {
  service().AppEvent(1);
  platform().takeLog();
  {
    const FailingAllocation failure(GetParam().nth);
    GetParam().queue(service());
    ASSERT_TRUE(FailingAllocation::hasFailed());
  }
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, {GetParam().line}));
  service().AppEvent(2);
  EXPECT_EQ(service().recvEvent()->value, 1);
  EXPECT_EQ(service().recvEvent()->value, 2);
  EXPECT_EQ(service().recvEvent(), nullptr);
}

void sendInput(EventService& service) {
  const Event input = pointerInput(BRIMOL_POINTER_DOWN, {1, 2});
  service.sendEvent(&input);
}
void raise(EventService& service) { service.AppEvent(9); }

INSTANTIATE_TEST_SUITE_P(
    Events, EventLoss,
    testing::Values(
        LossCase{"Input", sendInput, 1, "[EVENTSERVICE] sendEvent malloc fail!."},
        LossCase{"Application", raise, 1, "[EVENTSERVICE] AppEvent malloc fail!."},
        LossCase{"InputInTheQueue", sendInput, 2, "[EVENTSERVICE] saveQueue malloc fail!."},
        LossCase{"ApplicationInTheQueue", raise, 2, "[EVENTSERVICE] saveQueue malloc fail!."}),
    kRowName);

TEST_F(WidgetTest, ADisplayItemThatFindsNoMemoryTakesNoIndex) {
  const SKIA_Rect rect = {1, 2, 3, 4, 5};
  MW::Box box(&rect);
  WidgetList::init();
  {
    const FailingAllocation failure(1);
    EXPECT_EQ(box.add_MWWList(), -103);
  }
  EXPECT_EQ(WidgetList::findEmpty(), 0);
  EXPECT_EQ(box.add_MWWList(), 1);
}

// A layer needs memory now and then as it grows; the widget that finds none stays outside.
TEST_F(WidgetTest, AWidgetThatFindsNoMemoryStaysOutside) {
  std::vector<std::unique_ptr<ProbeWidget>> widgets;
  int refused = 0;
  for (int i = 0; i < 200; ++i) {
    auto& widget = *widgets.emplace_back(std::make_unique<ProbeWidget>());
    const FailingAllocation failure(1);
    EXPECT_EQ(Window::registerWidget(&widget), 1);
    if (!FailingAllocation::hasFailed()) continue;
    ++refused;
    EXPECT_EQ(widget.id(), 0);
  }
  EXPECT_GT(refused, 0);
  EXPECT_EQ(layerSize(1), 200 - refused);
}

// A layer that is full cannot grow; leaving it and walking over it go on.
TEST_F(AllocationTest, LeavingAndWalkingGoOn) {
  std::string calls;
  std::vector<std::unique_ptr<JournalWidget>> widgets;
  widgets.reserve(20);
  for (int i = 0; i < 20; ++i) widgets.push_back(std::make_unique<JournalWidget>(calls, 'w'));
  Window::show(1);
  {
    const FailingAllocation failure(1);
    Window::unregisterWidget(widgets.front().get());
    widgets.pop_back();
    EXPECT_FALSE(FailingAllocation::hasFailed()) << "leaving needs no memory";
  }
  calls.clear();
  Window::show(1);
  EXPECT_EQ(calls.size(), 18U);
}

struct Start {
  int result;
  bool failed;  // the allocation
};

Start startWithFailure(int nth) {
  const FailingAllocation failure(nth);
  const int result = Window::init();
  return {result, FailingAllocation::hasFailed()};
}

// Every single allocation of a start fails in turn; the threads' own classes allocate as well.
TEST_F(WidgetTest, StartsOrSaysWhyNot) {
  Start start = {0, true};
  for (int nth = 1; start.failed && nth < kEnough; ++nth) {
    SCOPED_TRACE(nth);
    platform().reset();
    start = startWithFailure(nth);
    if (start.result == 0) {
      EXPECT_EQ(platform().takeLog().back(),
                logLines(kError, {"[WINDOW] init->func_dispatchEvent failed!!"})[0]);
    }
    Window::destroy();
    EXPECT_EQ(Window::getEventService(), nullptr);
    EXPECT_EQ(platform().inits, platform().quits);
  }
  EXPECT_EQ(start.result, 1);
}

TEST_F(WidgetTest, AServiceWithoutItsThreadSaysSo) {
  {
    const FailingAllocation failure(1);
    EXPECT_EQ(EventService::startEvent(), 0);
  }
  EXPECT_EQ(platform().takeLog().back(),
            logLines(kError, {"[EVENTSERVICE] new func_eventLoop failed!!"})[0]);
  EventService::stopEvent();
  EXPECT_EQ(platform().quits, 1);
}

// A button that found no place in its layer is a button all the same.
TEST_F(WidgetTest, AButtonOutsideTheLayersCanBeUsed) {
  const SKIA_Rect rect = {0, 0, 10, 10, 5};
  std::vector<std::unique_ptr<MW::Button>> buttons;
  buttons.reserve(kEnough);
  bool refused = false;
  while (!refused && buttons.size() < kEnough) {
    const FailingAllocation failure(2);  // the button's own block is the first
    buttons.push_back(std::make_unique<MW::Button>(&rect, nullptr));
    refused = FailingAllocation::hasFailed();
  }
  ASSERT_TRUE(refused);
  EXPECT_TRUE(press(*buttons.back(), {5, 5}));
  EXPECT_EQ(shown(*buttons.back()).size(), 1U);
}

}  // namespace
