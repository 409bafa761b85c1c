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
  struct Change {
    int type;   // the layer
    int count;  // registrations minus unregistrations
    bool done;
  };

  /// Appends the widget to its layer and numbers it. Not done: no such layer, or no memory.
  static Change enter(Widget& widget);
  /// Takes the first widget of the same layer and id out and waits for its handlers on other
  /// threads. Counts, whether one was found or not.
  static Change leaveById(Widget& widget);
  /// Takes the widget itself out, wherever it stands, and waits likewise. Counts nothing.
  static void leave(Widget& widget);

  static const Layer& layer(int type);

 private:
  static bool isLayer(int type) { return type == kTopLayer || type == kBaseLayer; }

  static std::mutex lock;  // guards changes of the layers, the count, and Widget::registrations
  static std::array<Layer, 2> layers;
  static int widgetCount;
};

}  // namespace MW
