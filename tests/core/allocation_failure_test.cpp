// What the toolkit does where there is no memory. No failure may throw, crash, leak or change more
// than the operation that failed.

#include <MW/button.h>
#include <MW/event_service.h>
#include <MW/primitives.h>
#include <MW/static_text.h>
#include <android/log.h>

#include <utils/AndroidThreads.h>

#include <algorithm>
#include <string_view>

#include "core/dispatch_thread.h"
#include "support/failing_malloc.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Window;

// An event takes two allocations, its own and the queue's.
TEST_F(LiveWindowTest, ALostEventIsLoggedAndChangesNothingElse) {
  const auto logOf = [](int nth, const auto& queue) {
    platform().takeLog();
    const FailingAllocation failure(nth);
    queue();
    return platform().takeLog().at(0).message;
  };
  const auto raise = [&] { MW::EventService::AppEvent(9); };
  MW::EventService::AppEvent(1);
  EXPECT_EQ(logOf(1, [&] { MW::EventService::sendEvent(nullptr); }),
            "[EVENTSERVICE] sendEvent malloc fail!.");
  EXPECT_EQ(logOf(1, raise), "[EVENTSERVICE] AppEvent malloc fail!.");
  EXPECT_EQ(logOf(2, raise), "[EVENTSERVICE] saveQueue malloc fail!.");
  EXPECT_EQ(MW::EventService::recvEvent()->value, 1);
  EXPECT_EQ(MW::EventService::recvEvent(), nullptr);
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

int refusalsLogged = 0;

// A layer needs memory now and then as it grows; the button that finds none stays outside, and is a
// button all the same. Leaving a layer and walking over it need none.
TEST_F(WidgetTest, AWidgetThatFindsNoMemoryStaysOutside) {
  const SKIA_Rect rect = {0, 0, 10, 10, 5};
  std::vector<std::unique_ptr<MW::Button>> buttons(200);
  platform().records = false;
  __android_log_set_logger([](const __android_logger_data*, const char* line) {
    refusalsLogged += std::string_view(line) == "[WINDOW] registerWidget: not registered" ? 1 : 0;
  });
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
  EXPECT_EQ(refusalsLogged, refused);
  EXPECT_EQ(layerSize(1), 200 - refused);
  const FailingAllocation failure(1);
  buttons.clear();
  Window::show(1);
  EXPECT_FALSE(FailingAllocation::hasFailed());
}

TEST_F(WidgetTest, ATextThatFindsNoMemoryIsNotShown) {
  MW::StaticText viewer(nullptr, nullptr);
  for (const int nth : {1, 2}) {
    platform().records = false;
    const FailingAllocation failure(nth);
    viewer.setText("a text that is longer than what a string holds without memory");
    platform().records = true;
    EXPECT_EQ(shown(viewer).back().text.text, "no log");
  }
}

// A dispatch within so many drawing passes, each in a handler of the one before.
TEST_F(LiveWindowTest, ADialogKeepsAnEventEvenWithoutMemory) {
  const android::sp<MW::func_dispatchEvent> dispatcher = new MW::func_dispatchEvent;
  for (const int passes : {2, 40}) {
    bool isOffered = false;
    ProbeWidget dialog(MW::kTopLayer);
    ProbeWidget below;
    below.onEvent = [&](auto*, auto) { return isOffered = true; };
    int left = passes;
    below.onShow = [&](unsigned int) {
      if (--left > 0) return Window::show(0);
      MW::EventService::AppEvent(1);
      const FailingAllocation failure(1);
      dispatcher->threadLoop();
    };
    dialog.enter();
    below.enter();
    Window::show(0);
    EXPECT_FALSE(isOffered) << passes;
  }
}

// Every single allocation of a start and its end fails in turn; the threads' own classes allocate
// as well.
TEST_F(WidgetTest, StartsOrSaysWhyNot) {
#ifdef __ARM_EABI__
  GTEST_SKIP() << "the thread library has no unwind tables: its own bad_alloc ends the program";
#endif
  const std::vector<LogLine> refusals = logLines(
      kError,
      {"[WINDOW] init->func_dispatchEvent failed!!", "[WINDOW] init->EventService failed!!"});
  int started = 0;
  for (int nth = 1; nth < 200; ++nth) {
    SCOPED_TRACE(nth);
    platform().reset();
    auto failure = std::make_unique<FailingAllocation>(nth);
    started = Window::init();
    const bool hasService = Window::getEventService() != nullptr;
    Window::destroy();
    failure.reset();
    const std::vector<LogLine> log = platform().takeLog();
    const auto refusal = std::ranges::find_first_of(log, refusals);
    EXPECT_EQ(started == 1, refusal == log.end());
    EXPECT_TRUE(started == 0 || hasService);
    EXPECT_EQ(platform().inits, platform().quits);
  }
  EXPECT_EQ(started, 1);
}

// The platform starts one thread of the two, or none.
int startsLeft = 0;
// NOLINTNEXTLINE(readability-function-size): the thread library's own parameters
int startsOnly(android_thread_func_t entry, void* data, const char* name, int32_t priority,
               std::size_t stackBytes, android_thread_id_t* id) {
  if (startsLeft-- <= 0) return 0;
  return androidCreateRawThreadEtc(entry, data, name, priority, stackBytes, id);
}

TEST_F(WidgetTest, AThreadThatDoesNotStartIsLoggedAndLeavesNothing) {
  androidSetCreateThreadFunc(startsOnly);
  for (const int starts : {0, 1}) {
    platform().reset();
    startsLeft = starts;
    EXPECT_EQ(Window::init(), 0) << starts;
    const auto lines = platform().takeLog();
    const auto input = logLines(kError, {"[EVENTSERVICE] new func_eventLoop failed!!"});
    EXPECT_EQ(std::ranges::count(lines, input[0]), starts == 0 ? 1 : 0);
    const auto window = logLines(kError, {"[WINDOW] init->func_dispatchEvent failed!!"});
    EXPECT_EQ(std::ranges::count(lines, window[0]), 1);
    Window::destroy();
    EXPECT_EQ(platform().inits, platform().quits);
  }
  androidSetCreateThreadFunc(androidCreateRawThreadEtc);
  EXPECT_EQ(Window::init(), 1);
  Window::destroy();
}

}  // namespace
