#include <MW/event_service.h>
#include <MW/widget.h>
#include <MW/window.h>
#include <brimol/display.h>
#include <brimol/input.h>

#include <atomic>
#include <mutex>
#include <new>

#include "core/class_log.h"
#include "core/dispatch_thread.h"
#include "core/geometry.h"
#include "core/layer_walk.h"
#include "core/layers.h"
#include "core/life_turn.h"
#include "core/thread_start.h"

namespace MW {

namespace {

constexpr ClassLog kLog("WINDOW");
constexpr int kDefaultWidth = 1440;
constexpr int kDefaultHeight = 2560;
constexpr double kMmPerInch = 25.4;
constexpr double kRoundUp = 0.5;
constexpr const char* kEndsAfterHandler = "destroy: a handler's thread ends after the handler";
constexpr const char* kEndLeft = "destroy: a handler asks for it: the rest is left to another call";

constinit std::mutex updateLock;
constinit int displayUpdate = 0;  // guarded by updateLock

// The input thread may ask for the service while it is being created or deleted.
constinit std::atomic<EventService*> eventService = nullptr;

// Touched by the thread whose LifeTurn it is. Null until a start and after an end; one that is to
// end after its round stands here until somebody waited for it or the window starts again.
android::sp<func_dispatchEvent> event_dispatcher;

// False: it ends after its round, which this thread cannot wait for.
bool endDispatcher() {
  if (event_dispatcher == nullptr) return true;
  event_dispatcher->requestExit();
  if (event_dispatcher->isOnThisThread()) return true;
  if (LayerWalk::isOnThisThread()) return false;
  event_dispatcher->requestExitAndWait();
  event_dispatcher.clear();
  return true;
}

void endService() {
  delete eventService.load();
  eventService = nullptr;
}

void end() {
  if (event_dispatcher == nullptr && eventService == nullptr) {
    kLog.print(LogLevel::Warning, "destroy: it does not run");
  }
  if (!endDispatcher()) {
    kLog.print(LogLevel::Error, kEndLeft);
    return;
  }
  if (event_dispatcher != nullptr) kLog.print(LogLevel::Warning, kEndsAfterHandler);
  endService();
  kLog.print(LogLevel::Error, "event_dispatcher End");
}

bool isRunning() { return event_dispatcher != nullptr && !event_dispatcher->isEnding(); }

// Does what is left of an end that a handler asked for. False: this thread cannot wait for it.
bool finishEnd() {
  if (event_dispatcher == nullptr || isRunning()) return true;
  if (!endDispatcher()) return false;
  endService();
  return true;
}

bool startService() {
  if (eventService == nullptr) eventService = new (std::nothrow) EventService;
  if (eventService != nullptr) return true;
  kLog.print(LogLevel::Error, "init->EventService failed!!");
  return false;
}

// In a dispatched handler the thread that ends after that handler is still there: the new one
// waits for it, so that no two of them call handlers, and who waits for the new one waits for both.
bool startDispatcher() {
  const auto started = createThread<func_dispatchEvent>(event_dispatcher);
  if (started == nullptr || !startThread(*started)) {
    kLog.print(LogLevel::Error, "init->func_dispatchEvent failed!!");
    return false;
  }
  event_dispatcher = started;
  return true;
}

bool start() {
  if (!isRunning()) return startService() && startDispatcher();
  kLog.print(LogLevel::Warning, "init: it runs already");
  return true;
}

// A word that applications may set, and that any thread may read.
template <typename Number>
Number load(Number& word) {
  return std::atomic_ref(word).load(std::memory_order_relaxed);
}
template <typename Number>
void store(Number& word, Number value) {
  std::atomic_ref(word).store(value, std::memory_order_relaxed);
}

template <typename Visit>
void visitActive(int type, Visit visit) {
  const Layer& layer = Layers::layer(type);
  if (layer.isEmpty()) return;
  LayerWalk walk(layer);
  while (Widget* const widget = walk.next()) {
    if (widget->isActive()) visit(*widget);
  }
}

}  // namespace

int Window::width = 0;
int Window::height = 0;
float Window::xdpi = 0;
float Window::ydpi = 0;

int Window::init() {
  LifeTurn turn(LifeTurn::For::Start);
  if (!turn.isMine() || !finishEnd()) {
    kLog.print(LogLevel::Error, "init: the window is not at its end yet");
    return 0;
  }
  const bool runs = start();
  if (!turn.giveBack()) end();
  return runs ? 1 : 0;
}

int Window::destroy() {
  const LifeTurn turn(LifeTurn::For::End);
  if (turn.isMine()) {
    end();
  } else {
    kLog.print(LogLevel::Error, kEndLeft);
  }
  return 1;
}

EventService* Window::getEventService() { return eventService; }

int Window::registerWidget(Widget* widget) {
  if (widget == nullptr) {
    kLog.print(LogLevel::Error, "registerWidget: no widget");
    return 1;
  }
  kLog.print(LogLevel::Warning, "registerWidget: type=%d", widget->type());
  const Layers::Entry entry = Layers::enter(*widget);
  if (!entry.done) kLog.print(LogLevel::Error, "registerWidget: not registered");
  kLog.print(LogLevel::Debug, "registerWidget: num_widget=%d", entry.count);
  return 1;
}

int Window::unregisterWidget(Widget* widget) {
  if (widget == nullptr) {
    kLog.print(LogLevel::Error, "unregisterWidget: no widget");
    return 1;
  }
  Layers::leaveById(*widget);
  return 1;
}

void Window::show(unsigned int ticks) {
  const auto draw = [ticks](Widget& widget) { widget.show(ticks); };
  visitActive(kBaseLayer, draw);
  visitActive(kTopLayer, draw);
}

void Window::show() { show(GetTicks()); }

void Window::updateTimer(unsigned int) {
  const auto time = [now = GetTicks()](Widget& widget) { widget.updateTimer(now); };
  visitActive(kBaseLayer, time);
  visitActive(kTopLayer, time);
}

int Window::getwindowsize(int* outWidth, int* outHeight) {
  int w = load(width);
  int h = load(height);
  if (w == 0 || h == 0) {
    store(width, w = kDefaultWidth);
    store(height, h = kDefaultHeight);
  }
  if (outWidth != nullptr) *outWidth = w;
  if (outHeight != nullptr) *outHeight = h;
  return 1;
}

int Window::getMura(float* outXdpi, float* outYdpi, float mm) {
  float x = load(xdpi);
  float y = load(ydpi);
  if (x == 0 || y == 0) {
    getDpi(&x, &y);
    store(xdpi, x);
    store(ydpi, y);
  }
  if (outXdpi != nullptr) *outXdpi = x;
  if (outYdpi != nullptr) *outYdpi = y;
  // A density is rounded up and kept so, but never rounded down. The horizontal one serves both
  // axes and alone is rounded.
  const int rounded = truncated(double{x} + kRoundUp);
  if (rounded != truncated(x)) store(xdpi, x = static_cast<float>(rounded));
  const int pixels = truncated(mm * x / kMmPerInch);
  kLog.print(LogLevel::Error, "getMura[%f dpi] %fmm = %d pixel", x, mm, pixels);
  return pixels;
}

int Window::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return 0;
  switch (event->type) {
    case kEventMotion: onHover(); return 1;
    case kEventPress: onPress(); return 1;
    case kEventRelease: onRelease(); return 1;
    case kEventLongPress: onPressLong(); return 1;
    case kEventKeyPress: onKeyPressed(); return 1;
    case kEventKeyRelease: onKeyReleased(); return 1;
    default: return 0;
  }
}

void Window::onHover() { kLog.print(LogLevel::Debug, "over!!"); }
void Window::onPress() { kLog.print(LogLevel::Debug, "pressed!!"); }
void Window::onRelease() { kLog.print(LogLevel::Debug, "released!!"); }
void Window::onPressLong() { kLog.print(LogLevel::Debug, "long pressed!!"); }
void Window::onKeyPressed() { kLog.print(LogLevel::Debug, "key pressed!!"); }
void Window::onKeyReleased() { kLog.print(LogLevel::Debug, "key released!!"); }

int isDisplayUpdate(int set) {
  const std::lock_guard guard(updateLock);
  if (set != 0) {
    displayUpdate = 1;
    return 1;
  }
  const int wasDue = displayUpdate;
  displayUpdate = 0;
  return wasDue;
}

}  // namespace MW
