/// Tells a handler whether the callback that it has just called deleted the widget.
#pragma once

#include <atomic>

namespace MW {

class Widget;

/// Stands on the stack around a callback. The widget may be deleted by the callback itself, or on
/// another thread: deleting waits for a handler there, but not where that handler waits in turn for
/// one on the deleting thread.
class LifeGuard {
 public:
  explicit LifeGuard(const Widget* guarded);
  ~LifeGuard();
  LifeGuard(const LifeGuard&) = delete;
  LifeGuard& operator=(const LifeGuard&) = delete;

  bool isAlive() const { return widget != nullptr; }

  /// The widget's destructor tells every guard, of whatever thread.
  static void widgetEnds(const Widget* ended);

 private:
  std::atomic<const Widget*> widget;
  // The guards of all threads; guarded by a lock of their own.
  LifeGuard* older = nullptr;
  LifeGuard* newer = nullptr;
};

}  // namespace MW
