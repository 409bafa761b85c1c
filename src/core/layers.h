/// The window's two layers and the lock of those who change them.
#pragma once

#include <MW/records.h>

#include <array>
#include <mutex>

#include "core/layer.h"

namespace MW {

/// Static members only: there is one window.
class Layers {
 public:
  struct Entry {
    int count;  // registrations minus unregistrations
    bool done;
  };
  /// What becomes of the count when a widget leaves.
  enum class Count { Kept, Lowered };

  /// Appends the widget to its layer and numbers it. Not done: no such layer, or no memory.
  static Entry enter(Widget& widget);
  /// Takes the first widget of the same layer and id out and waits for its handlers on other
  /// threads. Lowers the count, whether one was found or not, and logs it.
  static void leaveById(Widget& widget);
  /// Takes the widget itself out, wherever it stands, and waits likewise. A count that is lowered
  /// is logged; it is lowered by 1, however often the widget was registered.
  static void leave(Widget& widget, Count count);

  static const Layer& layer(int type);

 private:
  static void logCount(int count);
  static bool isLayer(int type) { return type == kTopLayer || type == kBaseLayer; }

  static std::mutex lock;  // guards changes of the layers, the count, and Widget::registrations
  static std::array<Layer, 2> layers;
  static int widgetCount;
};

}  // namespace MW
