// What the toolkit does where there is no memory. No failure may throw, crash, leak or change more
// than the operation that failed.

#include <MW/button.h>
#include <MW/event_service.h>
#include <MW/primitives.h>
#include <MW/widget_list.h>
#include <MW/window.h>

#include <memory>
#include <utility>

#include "support/failing_malloc.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::EventService;
using MW::Window;

// An event takes two allocations, its own and the queue's.
TEST_F(LiveWindowTest, ALostEventIsLoggedAndChangesNothingElse) {
  EventService& service = *Window::getEventService();
  const Event input = pointerInput(BRIMOL_POINTER_DOWN, {1, 2});
  for (const auto& [nth, fromApplication, failed] :
       {std::tuple(1, false, "sendEvent"), std::tuple(1, true, "AppEvent"),
        std::tuple(2, false, "saveQueue"), std::tuple(2, true, "saveQueue")}) {
    service.AppEvent(1);
    platform().takeLog();
    {
      const FailingAllocation failure(nth);
      fromApplication ? service.AppEvent(9) : service.sendEvent(&input);
      ASSERT_TRUE(FailingAllocation::hasFailed());
    }
    const std::string line = std::string("[EVENTSERVICE] ") + failed + " malloc fail!.";
    EXPECT_EQ(platform().takeLog(), logLines(kDebug, {line}));
    EXPECT_EQ(service.recvEvent()->value, 1);
    EXPECT_EQ(service.recvEvent(), nullptr);
  }
}

TEST_F(WidgetTest, ADisplayItemThatFindsNoMemoryTakesNoIndex) {
  MW::Box box(nullptr);
  MW::WidgetList::init();
  {
    const FailingAllocation failure(1);
    EXPECT_EQ(box.add_MWWList(), -103);
  }
  EXPECT_EQ(MW::WidgetList::findEmpty(), 0);
  EXPECT_EQ(box.add_MWWList(), 1);
}

// A layer needs memory now and then as it grows; the button that finds none stays outside, and is a
// button all the same. Leaving a layer and walking over it need none.
TEST_F(WidgetTest, AWidgetThatFindsNoMemoryStaysOutside) {
  const SKIA_Rect rect = {0, 0, 10, 10, 5};
  std::vector<std::unique_ptr<MW::Button>> buttons(200);
  platform().records = false;
  int refused = 0;
  for (auto& each : buttons) {
    const FailingAllocation failure(2);  // the button's own block is the first
    each = std::make_unique<MW::Button>(&rect, nullptr);
    if (!FailingAllocation::hasFailed()) continue;
    ++refused;
    EXPECT_EQ(each->id(), 0);
    EXPECT_TRUE(press(*each, {5, 5}));
  }
  EXPECT_GT(refused, 0);
  EXPECT_EQ(layerSize(1), 200 - refused);
  const FailingAllocation failure(1);
  buttons.clear();
  Window::show(1);
  EXPECT_FALSE(FailingAllocation::hasFailed());
}

// Every single allocation of a start fails in turn; the threads' own classes allocate as well.
TEST_F(WidgetTest, StartsOrSaysWhyNot) {
  constexpr int kEnough = 1000;
  for (auto [nth, failed] = std::pair(1, true); failed && nth < kEnough; ++nth) {
    SCOPED_TRACE(nth);
    platform().reset();
    int result = 0;
    {
      const FailingAllocation failure(nth);
      result = Window::init();
      failed = FailingAllocation::hasFailed();
    }
    const LogLine refusal = logLines(kError, {"[WINDOW] init->func_dispatchEvent failed!!"})[0];
    EXPECT_NE(result == 1, platform().takeLog().back() == refusal);
    EXPECT_TRUE(failed || result == 1);
    Window::destroy();
    EXPECT_EQ(platform().inits, platform().quits);
  }
}

}  // namespace
