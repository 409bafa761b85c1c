/// Input: the platform's records become queued events. And where an event lies.
#pragma once

#include <MW/api.h>
#include <MW/records.h>
#include <brimol/input.h>

namespace MW {

/// Polls the platform's input on a thread of its own and queues what comes for the dispatch
/// thread. Window::init creates the one service, Window::destroy deletes it.
///
/// All operations are static, so that a call through what Window::getEventService() returned harms
/// nothing when no service runs any more: an event is then lost, and a warning is logged.
class MW_API EventService {
 public:
  /// Starts the platform's input and the input thread. Window::init does it for the application.
  EventService();
  /// Stops both and waits. Events that are still queued are lost, and their memory is not freed:
  /// the process keeps it to its end.
  ~EventService();
  EventService(const EventService&) = delete;
  EventService& operator=(const EventService&) = delete;

  /// What the constructor and the destructor call, and nobody else needs to: by the thread that is
  /// inside Window::init or destroy, one call of each. Both return 1; startEvent() returns 0, after
  /// an error line, when the thread could not be created.
  static int startEvent();
  static int stopEvent();
  /// 1 from the constructor on until the destructor begins, else 0. Any thread.
  static int isActive();

  /// Converts the platform's record and queues it. Without memory the event is lost and a line is
  /// logged. Any thread.
  static void sendEvent(const Event* event);
  /// Fills `data` from the platform's record. A type that is not known, or no record, gives
  /// kEventUnknown; without `data` nothing happens. Any thread.
  static void parseEvent(const Event* event, event_data* data);
  /// Queues a block from malloc, which recvEvent() frees. A block still queued when the service
  /// ends is freed by nobody. Without memory to queue it, or without a service, it is freed at once
  /// and a line is logged. Null is ignored. Any thread.
  static void saveQueue(event_data* data);
  /// Queues an application event (code 6) that carries `value`. As for sendEvent. Any thread.
  static void AppEvent(int value);
  /// The oldest event, in a record of the service that stays valid until the next call, or null.
  /// For one thread alone; while the window runs that is the dispatch thread.
  static event_data* recvEvent();

  /// Whether it is a pointer event inside `area`, left and top edges in, the others out. False
  /// where one of the two is null. Any thread; works without a service.
  static bool isMouseEventForMe(const SKIA_Rect* area, const event_data* event);
  /// The same for the event's point and those 20 pixels right, left, below and above it: whether
  /// one of them is inside.
  static bool isMouseEventAroundMe(const SKIA_Rect* area, const event_data* event);
};

/// True only for a pointer event of finger 0; false for null.
MW_API bool isFirstFinger(const event_data* event);

}  // namespace MW
