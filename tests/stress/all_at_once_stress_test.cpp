// All that may happen at the same time: both threads of the window, two more that post events and
// raise the flag, two that draw, while widgets are made and deleted on every side, dialogs are
// deleted by their own answers, and the window ends and starts again. BRIMOL_STRESS_EVENTS says how
// many events, 8,000 without it.
#include <MW/button.h>
#include <MW/dialog_new.h>
#include <MW/event_service.h>

#include <cstdlib>
#include <thread>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Window;

constexpr int kStarts = 10;  // of the window
constexpr int kPosters = 2;
constexpr int kLast = -1;  // what the application event says that ends a start
constexpr SKIA_Rect kScreen = {0, 0, 1000, 1000, 0xFF000000};

int eventsOfAPoster() {
  const char* const wanted = std::getenv("BRIMOL_STRESS_EVENTS");
  return (wanted == nullptr ? 8'000 : std::atoi(wanted)) / (kStarts * kPosters);
}

std::atomic<MW::DialogNew*> prompt = nullptr;  // whoever takes it out deletes it
std::atomic<int> answers = 0;

void ask() {
  if (prompt != nullptr) return;
  auto made = std::make_unique<MW::DialogNew>("Sensor", SKIA_ALIGN_CENTRE, 7);
  made->setDesc("Cover the sensor", "with a finger", nullptr);
  made->keyReleaseCallback = [](MW::kbd_event*) {
    ++answers;
    delete prompt.exchange(nullptr);
    MW::isDisplayUpdate(1);
  };
  made->setActive(1);
  prompt = made.release();
}

std::unique_ptr<MW::Button> makeButton() {
  auto made = std::make_unique<MW::Button>(&kScreen, nullptr);
  made->clickCallback = [](int) { ask(); };
  made->setActive(1);
  return made;
}

MW::event_data* keyRelease() {
  auto* const event = static_cast<MW::event_data*>(std::malloc(sizeof(MW::event_data)));
  *event = {};
  event->type = MW::kEventKeyRelease;
  event->key.code = MW::kKeySelect;
  return event;
}

// Every kind of post, and widgets of the thread's own.
void post(int events) {
  MW::EventService& service = *Window::getEventService();
  for (int i = 0; i < events; ++i) {
    const Event down = pointerInput(BRIMOL_POINTER_DOWN, {5, 5});
    const Event up = pointerInput(BRIMOL_POINTER_UP, {5, 5});
    switch (i % 4) {
      case 0: service.sendEvent(&down); break;
      case 1: service.sendEvent(&up); break;
      case 2: service.saveQueue(keyRelease()); break;
      default: service.AppEvent(i); break;
    }
    MW::isDisplayUpdate(1);
    if (i % 16 == 0) makeButton();
    if (i % 64 == 0) std::this_thread::yield();
  }
}

// Two threads post, and the calling one draws, while widgets come and go on all of them.
void postFromTwoThreads(int events) {
  const std::jthread one(post, events);
  const std::jthread other(post, events);
  for (int i = 0; i < events / 8; ++i) {
    const auto passing = makeButton();
    Window::show(GetTicks());
    Window::updateTimer(GetTicks());
  }
}

// Until the last event has gone through: events that are left in the queue are nobody's.
void drain(const std::atomic<bool>& isDrained) {
  while (!isDrained) {
    delete prompt.exchange(nullptr);
    Window::getEventService()->AppEvent(kLast);
    for (int i = 0; i < 64 && !isDrained; ++i) std::this_thread::yield();
  }
}

void runWindowOnce(int events) {
  std::atomic<bool> isDrained = false;
  std::atomic<bool> isOver = false;
  ProbeWidget last;
  last.onEvent = [&](const MW::event_data* event, unsigned int) {
    if (event->type == MW::kEventApplication && event->value == kLast) isDrained = true;
    return false;
  };
  last.enter();
  const auto button = makeButton();
  ASSERT_EQ(Window::init(), 1);
  std::jthread secondDrawing([&] {
    while (!isOver) Window::show(GetTicks());
  });
  postFromTwoThreads(events);
  drain(isDrained);
  Window::destroy();
  isOver = true;
  delete prompt.exchange(nullptr);
}

TEST_F(WidgetTest, EverythingAtOnce) {
  platform().records = false;
  const int events = eventsOfAPoster();
  answers = 0;
  for (int start = 0; start < kStarts; ++start) runWindowOnce(events);
  EXPECT_GT(answers, 0);
}

}  // namespace
