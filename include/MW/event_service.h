/// Input: from the platform's records to queued events, and the tests that widgets make on them.
#pragma once

#include <MW/api.h>
#include <MW/records.h>
#include <brimol/input.h>

#include <atomic>
#include <list>

namespace MW {

/// Polls the platform's input on a thread of its own and queues what comes for the dispatch
/// thread. Window::init creates the one service, Window::destroy deletes it.
class MW_API EventService {
 public:
  /// Starts the platform's input and the input thread.
  EventService();
  /// Stops both and waits. Events still queued are not freed: they may be the application's.
  ~EventService();
  EventService(const EventService&) = delete;
  EventService& operator=(const EventService&) = delete;

  /// 1, or 0 when the thread could not be created.
  static int startEvent();
  static int stopEvent();
  int isActive() const;

  /// Converts the platform's record and queues it. Without memory the event is lost and a line is
  /// logged. Any thread.
  void sendEvent(const Event* event);
  /// Fills `data` from the platform's record. A type that is not known gives kEventUnknown.
  static void parseEvent(const Event* event, event_data* data);
  /// Queues a block from malloc, which the queue owns from here on; without memory it is freed and
  /// a line logged. Null is ignored. Any thread.
  void saveQueue(event_data* data);
  /// Queues an application event (code 6) that carries `value`. As for sendEvent. Any thread.
  void AppEvent(int value);
  /// The oldest event, in a record that stays valid until the next call, or null. One thread.
  event_data* recvEvent();

  /// True for a pointer event inside `area`. Null records are nowhere. Any thread; works without
  /// a service.
  static bool isMouseEventForMe(const SKIA_Rect* area, const event_data* event);
  /// True when the event's point, or one 20 pixels right, left, below or above it, is inside.
  static bool isMouseEventAroundMe(const SKIA_Rect* area, const event_data* event);

 private:
  std::list<event_data*> queue;  // guarded by the queue lock
  std::atomic<int> active = 1;
};

/// True only for a pointer event of finger 0. Null is none.
MW_API bool isFirstFinger(const event_data* event);

}  // namespace MW
