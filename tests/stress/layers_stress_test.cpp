// Widgets come and go from every side while the dispatch thread, a drawing pass and a timer pass
// walk over the layers. Nothing that has left may be called; the sanitizers see what is missed
// here.

#include <MW/button.h>

#include <array>
#include <latch>
#include <thread>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Button;
using MW::Window;

constexpr int kEntries = 200'000;
constexpr int kOffers = 2'000;  // to the gardener, at least
constexpr SKIA_Rect kScreen = {0, 0, 1000, 1000, 0xFF000000};

std::atomic<int> entries;

std::unique_ptr<ProbeWidget> makeWidget(int layer = 1) {
  auto made = std::make_unique<ProbeWidget>(layer);
  made->onShow = made->onTimer = [](unsigned int) { std::this_thread::yield(); };
  made->enter();
  ++entries;
  return made;
}

std::atomic<Button*> doomedButton = nullptr;  // whoever takes it out deletes it

void replaceDoomed(int round) {
  if (round % 64 == 0) delete doomedButton.exchange(nullptr);  // it may stand in no layer
  if (doomedButton != nullptr) return;
  auto added = std::make_unique<Button>(&kScreen, nullptr);
  added->clickCallback = [](int) { delete doomedButton.exchange(nullptr); };
  added->setActive(1);
  doomedButton = added.release();
}

// What one thread does until there were enough entries. Ids are numbers of a layer's size, and
// so the threads unregister each other's widgets.
void churn() {
  for (int i = 0; entries < kEntries; ++i) {
    auto a = makeWidget(i % 8 == 0 ? 0 : 1);
    const auto b = makeWidget();
    if (i % 3 == 0) Window::registerWidget(a.get());  // twice; its end takes both out
    if (i % 7 == 0) a->setType(1 - a->type());        // and from where they are
    if (i % 2 == 0) Window::unregisterWidget(a.get());
    if (i % 5 == 0) a.reset();
    std::this_thread::yield();
  }
}

TEST_F(WidgetTest, WidgetsComeAndGoWhileWalksRun) {
  platform().records = false;
  std::atomic<int> offers = 0;
  std::unique_ptr<ProbeWidget> drawn;    // of the application's thread
  std::unique_ptr<ProbeWidget> offered;  // of the dispatch thread
  {
    ProbeWidget gardener;  // registers and deletes others from inside its handlers
    gardener.onShow = [&](unsigned int) { drawn = makeWidget(); };
    gardener.onEvent = [&](MW::event_data*, unsigned int) {
      offered = makeWidget();
      return ++offers == 0;
    };
    gardener.enter();
    gardener.setId(-1);  // nobody else's, so that it stays
    ASSERT_EQ(Window::init(), 1);
    const std::array<std::jthread, 2> others = {std::jthread(churn), std::jthread(churn)};
    for (int i = 0; entries < kEntries || offers < kOffers; ++i) {
      platform().feed(pointerInput(i % 2 == 0 ? BRIMOL_POINTER_DOWN : BRIMOL_POINTER_UP, {5, 5}));
      Window::show(0);
      replaceDoomed(i);
      Window::updateTimer(0);
    }
  }
  Window::destroy();
  delete doomedButton.exchange(nullptr);
  EXPECT_EQ(MW::isDisplayUpdate(0), 1) << "buttons took events";
}

thread_local std::size_t ownWidget = 0;

// Each of three threads draws, and from inside its widget unregisters the next thread's one.
TEST_F(WidgetTest, ThreadsThatUnregisterEachOthersWidgetDoNotHang) {
  std::array<ProbeWidget, 3> widgets;
  std::latch allInside(3);
  for (std::size_t i = 0; i < 3; ++i) {
    widgets.at(i).onShow = [&, i](unsigned int) {
      if (ownWidget != i) return;
      allInside.arrive_and_wait();
      Window::unregisterWidget(&widgets.at((i + 1) % 3));
    };
    widgets.at(i).enter();
  }
  const auto draw = [](std::size_t own) {
    ownWidget = own;
    Window::show(0);
  };
  {
    const std::array<std::jthread, 3> threads = {std::jthread(draw, 0), std::jthread(draw, 1),
                                                 std::jthread(draw, 2)};
  }
  EXPECT_EQ(layerSize(1), 0);
}

// An input event reaches a widget and raises the flag, again and again, and at last ends the
// window.
TEST_F(WidgetTest, TheWindowsThreadsBringInputToAWidget) {
  for (int i = 20; i >= 0; --i) {
    std::latch offered(1);
    ProbeWidget widget;
    widget.onEvent = [&](const MW::event_data* event, unsigned int) {
      EXPECT_EQ(event->mouse.x, i);
      if (i == 0) Window::destroy();
      offered.count_down();
      return true;
    };
    widget.enter();
    ASSERT_EQ(Window::init(), 1);
    platform().feed(pointerInput(BRIMOL_POINTER_UP, {i, 5}));
    offered.wait();
    if (i == 0) break;
    Window::destroy();  // after the round that the event belongs to
    EXPECT_EQ(MW::isDisplayUpdate(0), 1);
  }
  EXPECT_EQ(Window::getEventService(), nullptr);
  Window::destroy();  // waits for the thread that ended itself
}

void unregister(std::unique_ptr<ProbeWidget>& widget) { Window::unregisterWidget(widget.get()); }
void destroy(std::unique_ptr<ProbeWidget>& widget) { widget.reset(); }
void unregisterTwin(std::unique_ptr<ProbeWidget>& widget) {
  ProbeWidget twin;
  twin.setId(widget->id());
  Window::unregisterWidget(&twin);
}

void expectWait(void (*leave)(std::unique_ptr<ProbeWidget>&), bool leftBefore) {
  std::latch entered(1);
  std::atomic<bool> done = false;
  auto widget = std::make_unique<ProbeWidget>();
  widget->onShow = [&](unsigned int) {
    if (leftBefore) unregister(widget);
    entered.count_down();
    for (int i = 0; i < 2000; ++i) std::this_thread::yield();
    done = true;
  };
  widget->enter();
  const std::jthread drawing([] { Window::show(0); });
  entered.wait();
  leave(widget);
  EXPECT_TRUE(done);
}

TEST_F(WidgetTest, LeavingWaitsForAHandlerOnAnotherThread) {
  expectWait(unregister, false);
  expectWait(unregister, true);
  expectWait(destroy, false);
  expectWait(destroy, true);
  expectWait(unregisterTwin, false);
}

}  // namespace
