/// Tells a handler whether the callback that it has just called deleted the widget.
#pragma once

namespace MW {

class Widget;

/// Stands on the stack around a callback, on the thread that calls it. A handler of a widget runs
/// on one thread at a time for each walk, and deletion waits for the other threads, so that only
/// this thread can delete the widget meanwhile.
class LifeGuard {
 public:
  explicit LifeGuard(const Widget* guarded);
  ~LifeGuard();
  LifeGuard(const LifeGuard&) = delete;
  LifeGuard& operator=(const LifeGuard&) = delete;

  bool isAlive() const { return widget != nullptr; }

  /// The widget's destructor tells every guard of this thread.
  static void widgetEnds(const Widget* ended);

 private:
  const Widget* widget;
  LifeGuard* outer;
};

}  // namespace MW
