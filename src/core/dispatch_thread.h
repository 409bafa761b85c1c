/// The thread that hands queued events to the widgets.
#pragma once

#include <utils/Thread.h>

#include <atomic>
#include <thread>

namespace MW {

/// Window::init starts it. It takes one event a round from the event service, offers it to the
/// active widgets of the top layer and, while none is active there, to those of the base layer,
/// and raises the redraw flag for an event that a widget took.
class func_dispatchEvent : public android::Thread {
 public:
  /// It begins once `replaced`, if any, has ended.
  explicit func_dispatchEvent(android::sp<func_dispatchEvent> replaced = nullptr);
  ~func_dispatchEvent() override;

  /// Waits for the replaced one.
  android::status_t readyToRun() override;

  /// One round, which ends with a pause of a millisecond. Returns true: go on.
  bool threadLoop() override;

  /// Whether its thread calls this, that is: a handler.
  bool isOnThisThread() const;
  /// Whether it is to end after its round, or has ended.
  bool isEnding() const { return exitPending(); }

 private:
  std::atomic<std::thread::id> thread;
  android::sp<func_dispatchEvent> before;  // touched by its own thread once that runs
};

}  // namespace MW
