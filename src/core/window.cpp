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
#include "core/layers.h"
#include "core/thread_start.h"

namespace MW {

namespace {

constexpr ClassLog kLog("WINDOW");
constexpr int kDefaultWidth = 1440;
constexpr int kDefaultHeight = 2560;
constexpr double kMmPerInch = 25.4;
constexpr double kRoundUp = 0.5;

constinit std::mutex updateLock;
constinit int displayUpdate = 0;  // guarded by updateLock

// The input thread may ask for the service while it is being created or deleted.
constinit std::atomic<EventService*> eventService = nullptr;

// Null until init; init and destroy alone touch it.
android::sp<func_dispatchEvent> event_dispatcher;

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
  if (event_dispatcher != nullptr) return 1;
  if (eventService == nullptr) eventService = new (std::nothrow) EventService;
  event_dispatcher = createThread<func_dispatchEvent>();
  if (event_dispatcher == nullptr || !startThread(*event_dispatcher)) {
    event_dispatcher.clear();
    kLog.print(LogLevel::Error, "init->func_dispatchEvent failed!!");
    return 0;
  }
  return 1;
}

int Window::destroy() {
  if (event_dispatcher != nullptr) {
    // A callback on the dispatch thread that ends the window cannot wait for its own thread; the
    // thread then ends after this round.
    event_dispatcher->requestExit();
    event_dispatcher->requestExitAndWait();
  }
  event_dispatcher.clear();
  delete eventService.load();
  eventService = nullptr;
  kLog.print(LogLevel::Error, "event_dispatcher End");
  return 1;
}

EventService* Window::getEventService() { return eventService; }

int Window::registerWidget(Widget* widget) {
  if (widget == nullptr) {
    kLog.print(LogLevel::Error, "registerWidget: no widget");
    return 1;
  }
  kLog.print(LogLevel::Warning, "registerWidget: type=%d", widget->type());
  const Layers::Change change = Layers::enter(*widget);
  if (!change.done) kLog.print(LogLevel::Error, "registerWidget: not registered");
  kLog.print(LogLevel::Debug, "registerWidget: num_widget=%d", change.count);
  return 1;
}

int Window::unregisterWidget(Widget* widget) {
  if (widget == nullptr) {
    kLog.print(LogLevel::Error, "unregisterWidget: no widget");
    return 1;
  }
  const Layers::Change change = Layers::leaveById(*widget);
  kLog.print(LogLevel::Debug, "unregisterWidget: num_widget=%d", change.count);
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
  if (width == 0 || height == 0) {
    width = kDefaultWidth;
    height = kDefaultHeight;
  }
  if (outWidth != nullptr) *outWidth = width;
  if (outHeight != nullptr) *outHeight = height;
  return 1;
}

int Window::getMura(float* outXdpi, float* outYdpi, float mm) {
  if (xdpi == 0 || ydpi == 0) getDpi(&xdpi, &ydpi);
  if (outXdpi != nullptr) *outXdpi = xdpi;
  if (outYdpi != nullptr) *outYdpi = ydpi;
  // Rounded up and kept so, but never rounded down: meant so, and so is that the horizontal
  // density alone is rounded and serves both axes.
  const int rounded = truncated(double{xdpi} + kRoundUp);
  if (rounded != truncated(xdpi)) xdpi = static_cast<float>(rounded);
  const int pixels = truncated(mm * xdpi / kMmPerInch);
  kLog.print(LogLevel::Error, "getMura[%f dpi] %fmm = %d pixel", xdpi, mm, pixels);
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
