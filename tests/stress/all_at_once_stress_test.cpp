// All that may happen at the same time: both threads of the window, two more that post events and
// raise the flag, two that draw, while widgets are made and deleted on every side, dialogs are
// deleted by their own answers, and the window ends and starts again. BRIMOL_STRESS_EVENTS says how
// many events, 8,000 without it.
#include <MW/button.h>
#include <MW/dialog_new.h>
#include <MW/event_service.h>
#include <MW/key.h>

#include <array>
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
  for (int i = 0; i < events; ++i) {
    const Event down = pointerInput(BRIMOL_POINTER_DOWN, {5, 5});
    const Event up = pointerInput(BRIMOL_POINTER_UP, {5, 5});
    switch (i % 4) {
      case 0: MW::EventService::sendEvent(&down); break;
      case 1: MW::EventService::sendEvent(&up); break;
      case 2: MW::EventService::saveQueue(keyRelease()); break;
      default: MW::EventService::AppEvent(i); break;
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
    MW::EventService::AppEvent(kLast);
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

constexpr std::size_t kMostInCircle = 3;
// Whoever takes one out deletes it.
std::array<std::atomic<MW::Widget*>, kMostInCircle> circle = {};
std::atomic<std::size_t> arriving = 0;  // callbacks that the others still wait for
std::atomic<std::size_t> leaving = 0;   // callbacks that have something left to do

void countDown(std::atomic<std::size_t>& count) {
  if (--count == 0) count.notify_all();
}
void awaitZero(const std::atomic<std::size_t>& count) {
  for (std::size_t seen = count; seen != 0; seen = count) count.wait(seen);
}

// Waits until each widget of the circle runs its callback, and deletes the next one and its own.
void breakCircle(std::size_t own, std::size_t size) {
  countDown(arriving);
  awaitZero(arriving);
  delete circle.at((own + 1) % size).exchange(nullptr);
  delete circle.at(own).exchange(nullptr);
  countDown(leaving);
}

// The place of its own, and of how many, a key tells by the state and the code of its plug.
void keepPlug(std::size_t own, std::size_t size) {
  auto key = std::make_unique<MW::Key>();
  key->plugCallback = [](MW::kbd_event* plug) {
    breakCircle(plug->state % kMostInCircle, plug->state / kMostInCircle);
  };
  key->onPlugKey({static_cast<uint32_t>(size * kMostInCircle + own), MW::Key::kPlugSettled});
  circle.at(own) = key.release();
}

template <std::size_t size>
void putDialog() {
  auto dialog = std::make_unique<MW::DialogNew>("Circle", SKIA_ALIGN_CENTRE, 7);
  dialog->keyReleaseCallback = [](MW::kbd_event*) { breakCircle(0, size); };
  dialog->setActive(1);
  circle.at(0) = dialog.release();
}

// The dispatch thread answers a dialog while drawing threads tell of plugs.
template <std::size_t size>
void runCircle() {
  arriving = leaving = size;
  putDialog<size>();
  for (std::size_t own = 1; own < size; ++own) keepPlug(own, size);
  platform().ticks += 1000;
  MW::EventService::saveQueue(keyRelease());
  {
    std::array<std::jthread, size - 1> drawing;
    for (auto& each : drawing) each = std::jthread([] { Window::show(GetTicks()); });
  }
  awaitZero(leaving);
}

TEST_F(WidgetTest, CirclesOfThreadsDeleteEachOthersWidgets) {
  platform().records = false;
  for (int start = 0; start < kStarts; ++start) {
    ASSERT_EQ(Window::init(), 1);
    for (int round = 0; round < 20; ++round) {
      runCircle<2>();
      runCircle<3>();
    }
    Window::destroy();
    for (const auto& each : circle) EXPECT_EQ(each, nullptr);
  }
}

}  // namespace
