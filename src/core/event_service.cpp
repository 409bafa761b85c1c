#include <MW/event_service.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <cstdlib>
#include <list>
#include <memory>
#include <mutex>
#include <new>

#include "core/class_log.h"
#include "core/hit_test.h"
#include "core/input_thread.h"
#include "core/thread_start.h"

namespace MW {

namespace {

constexpr ClassLog kLog("EVENTSERVICE");
constexpr int kProbeDistance = 20;  // pixels

constinit std::mutex EvtQL;  // the queue lock
constinit event_data handedOut = {};
constinit std::atomic<int> active = 0;

// Guarded by EvtQL.
struct Queue {
  bool isOpen = false;  // a service runs
  std::list<event_data*> waiting;
  std::list<event_data*> lost;  // what waited when a service ended may be the application's
};
// Never deleted: threads may still post while the process ends.
Queue& queue = *new Queue;

// Null until startEvent. Whoever creates and deletes the service touches it, one thread at a time:
// Window's lock sees to that.
android::sp<func_eventLoop> thread_event;

struct Free {
  void operator()(event_data* block) const { std::free(block); }
};
using EventBlock = std::unique_ptr<event_data, Free>;

// Events cross the queue as blocks from malloc, so that applications can queue their own. Zeroed.
EventBlock allocateEvent() {
  EventBlock block(static_cast<event_data*>(std::malloc(sizeof(event_data))));
  if (block) *block = {};
  return block;
}

void parsePointer(EventCode code, const BrimolPointerEvent& event, event_data& data) {
  data.type = code;
  data.mouse = {event.state, event.finger, event.x, event.y, 0, 0};
}

void parseKey(EventCode code, const BrimolKeyEvent& event, event_data& data) {
  data.type = code;
  data.key = {event.state, event.code};
}

}  // namespace

EventService::EventService() {
  thread_event.clear();  // the ended thread of a service before this one
  {
    const std::lock_guard guard(EvtQL);
    queue.isOpen = true;
  }
  active = 1;
  startEvent();
}

EventService::~EventService() {
  active = 0;
  stopEvent();
  const std::lock_guard guard(EvtQL);
  queue.isOpen = false;
  queue.lost.splice(queue.lost.end(), queue.waiting);
}

int EventService::startEvent() {
  kLog.print(LogLevel::Debug, "startEvent->EventInit");
  EventInit(BRIMOL_INPUT_FLAGS);
  thread_event = createThread<func_eventLoop>();
  if (thread_event == nullptr || !startThread(*thread_event)) {
    thread_event.clear();
    kLog.print(LogLevel::Error, "new func_eventLoop failed!!");
    return 0;
  }
  kLog.print(LogLevel::Debug, "startEvent (threadLoop)");
  return 1;
}

int EventService::stopEvent() {
  if (thread_event != nullptr) thread_event->requestExitAndWait();
  EventQuit();
  kLog.print(LogLevel::Error, "stopEvent End");
  return 1;
}

int EventService::isActive() { return active; }

void EventService::sendEvent(const Event* event) {
  EventBlock block = allocateEvent();
  if (!block) {
    kLog.print(LogLevel::Debug, "sendEvent malloc fail!.");
    return;
  }
  parseEvent(event, block.get());
  saveQueue(block.release());
}

void EventService::parseEvent(const Event* event, event_data* data) {
  if (data == nullptr) return;
  *data = {.type = kEventUnknown, .mouse = {}};
  if (event == nullptr) return;
  switch (event->type) {
    case BRIMOL_POINTER_MOTION:
      parsePointer(kEventMotion, event->pointer, *data);
      data->mouse.xrel = event->pointer.xrel;
      data->mouse.yrel = event->pointer.yrel;
      return;
    case BRIMOL_POINTER_DOWN: return parsePointer(kEventPress, event->pointer, *data);
    case BRIMOL_POINTER_UP: return parsePointer(kEventRelease, event->pointer, *data);
    case BRIMOL_LONG_PRESS: return parsePointer(kEventLongPress, event->pointer, *data);
    case BRIMOL_KEY_DOWN: return parseKey(kEventKeyPress, event->key, *data);
    case BRIMOL_KEY_UP: return parseKey(kEventKeyRelease, event->key, *data);
    case BRIMOL_USER_EVENT:
      data->type = kEventUser;
      data->key = {event->user.word2, event->user.word1};
      return;
    default: return;
  }
}

void EventService::saveQueue(event_data* data) {
  if (data == nullptr) return;
  EventBlock block(data);
  const std::lock_guard guard(EvtQL);
  if (!queue.isOpen) {
    kLog.print(LogLevel::Warning, "saveQueue: no service runs, the event is lost");
    return;
  }
  try {
    queue.waiting.push_back(data);
    (void)block.release();
  } catch (const std::bad_alloc&) {
    kLog.print(LogLevel::Debug, "saveQueue malloc fail!.");
  }
}

void EventService::AppEvent(int value) {
  EventBlock block = allocateEvent();
  if (!block) {
    kLog.print(LogLevel::Debug, "AppEvent malloc fail!.");
    return;
  }
  block->type = kEventApplication;
  block->value = value;
  saveQueue(block.release());
}

event_data* EventService::recvEvent() {
  const std::lock_guard guard(EvtQL);
  if (queue.waiting.empty()) return nullptr;
  const EventBlock front(queue.waiting.front());
  queue.waiting.pop_front();
  handedOut = *front;
  return &handedOut;
}

bool EventService::isMouseEventForMe(const SKIA_Rect* area, const event_data* event) {
  if (area == nullptr || event == nullptr) return false;
  const std::lock_guard guard(EvtQL);
  return isPointerEvent(*event) && contains(*area, positionOf(*event));
}

bool EventService::isMouseEventAroundMe(const SKIA_Rect* area, const event_data* event) {
  if (area == nullptr || event == nullptr) return false;
  static constexpr auto kProbes = std::to_array<Position>({
      {0, 0},
      {kProbeDistance, 0},
      {-kProbeDistance, 0},
      {0, kProbeDistance},
      {0, -kProbeDistance},
  });
  const std::lock_guard guard(EvtQL);
  return isPointerEvent(*event) && std::ranges::any_of(kProbes, [&](const Position& probe) {
           return contains(*area, {event->mouse.x + probe.x, event->mouse.y + probe.y});
         });
}

bool isFirstFinger(const event_data* event) {
  return event != nullptr && isPointerEvent(*event) && event->mouse.finger == 0;
}

}  // namespace MW
