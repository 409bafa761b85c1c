// The toolkit's real threads, and what they promise each other.

#include <MW/button.h>
#include <MW/event_service.h>
#include <MW/window.h>

#include <latch>
#include <memory>
#include <thread>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Button;
using MW::Window;

using ThreadsTest = WidgetTest;

constexpr SKIA_Rect kArea = {100, 100, 50, 50, 0xFF000000};

std::latch* clicked;

TEST_F(ThreadsTest, APlatformEventReachesTheCallbackAndRaisesTheFlag) {
  std::latch latch(1);
  clicked = &latch;
  Button button(&kArea, nullptr);
  button.setActive(1);
  button.clickCallback = [](int) { clicked->count_down(); };
  ASSERT_EQ(Window::init(), 1);
  platform().feed(pointerInput(BRIMOL_POINTER_DOWN, {100, 100}));
  platform().feed(pointerInput(BRIMOL_POINTER_UP, {149, 149}));
  latch.wait();
  Window::destroy();  // after the round that the click belongs to
  EXPECT_EQ(MW::isDisplayUpdate(0), 1);
}

TEST_F(ThreadsTest, TheWindowStartsAgainAndAgain) {
  for (int i = 0; i < 20; ++i) {
    std::latch latch(1);
    ProbeWidget widget;
    widget.onEvent = [&latch, i](const MW::event_data* event, unsigned int) {
      EXPECT_EQ(event->value, i);
      latch.count_down();
      return true;
    };
    widget.setActive(1);
    Window::registerWidget(&widget);
    ASSERT_EQ(Window::init(), 1);
    Window::getEventService()->AppEvent(i);
    latch.wait();
    Window::destroy();
  }
}

TEST_F(ThreadsTest, ACallbackMayEndTheWindow) {
  std::latch ended(1);
  ProbeWidget widget;
  widget.onEvent = [&ended](MW::event_data*, unsigned int) {
    Window::destroy();
    ended.count_down();
    return true;
  };
  widget.setActive(1);
  Window::registerWidget(&widget);
  ASSERT_EQ(Window::init(), 1);
  platform().feed(pointerInput(BRIMOL_POINTER_DOWN, {1, 1}));
  ended.wait();
  EXPECT_EQ(Window::getEventService(), nullptr);
  Window::unregisterWidget(&widget);  // the handler has returned behind this
  EXPECT_EQ(platform().quits, 1);
}

struct LeaveCase : Row {
  bool leftBefore;  // its own handler has unregistered it
  void (*leave)(std::unique_ptr<ProbeWidget>&);
};

void unregister(std::unique_ptr<ProbeWidget>& widget) { Window::unregisterWidget(widget.get()); }
void destroy(std::unique_ptr<ProbeWidget>& widget) { widget.reset(); }
void unregisterTwin(std::unique_ptr<ProbeWidget>& widget) {
  ProbeWidget twin;
  twin.setId(widget->id());
  Window::unregisterWidget(&twin);
}

class Leaving : public WidgetTest, public testing::WithParamInterface<LeaveCase> {};

TEST_P(Leaving, WaitsForAHandlerOnAnotherThread) {
  constexpr int kWork = 2000;
  std::latch entered(1);
  std::latch goOn(1);
  std::atomic<bool> done = false;
  auto widget = std::make_unique<ProbeWidget>();
  widget->onShow = [&](unsigned int) {
    if (GetParam().leftBefore) Window::unregisterWidget(widget.get());
    entered.count_down();
    goOn.wait();
    for (int i = 0; i < kWork; ++i) std::this_thread::yield();
    done = true;
  };
  widget->setActive(1);
  Window::registerWidget(widget.get());
  std::thread drawing([] { Window::show(0); });
  entered.wait();
  goOn.count_down();
  GetParam().leave(widget);
  EXPECT_TRUE(done);
  drawing.join();
}

INSTANTIATE_TEST_SUITE_P(Ways, Leaving,
                         testing::Values(LeaveCase{"Unregistered", false, unregister},
                                         LeaveCase{"UnregisteredAgain", true, unregister},
                                         LeaveCase{"Deleted", false, destroy},
                                         LeaveCase{"DeletedWhenGone", true, destroy},
                                         LeaveCase{"RemovedByAnEqualId", false, unregisterTwin}),
                         kRowName);

}  // namespace
