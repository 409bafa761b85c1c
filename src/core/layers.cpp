#include "core/layers.h"

#include <MW/widget.h>

#include "core/class_log.h"
#include "core/layer_walk.h"

namespace MW {

namespace {
constexpr ClassLog kLog("WINDOW");
}

constinit std::mutex Layers::lock;
constinit std::array<Layer, 2> Layers::layers;
constinit int Layers::widgetCount = 0;

const Layer& Layers::layer(int type) { return layers[static_cast<std::size_t>(type)]; }

Layers::Entry Layers::enter(Widget& widget) {
  const std::lock_guard guard(lock);
  const int type = widget.type();
  if (!isLayer(type)) return {widgetCount, false};
  const int size = layers[static_cast<std::size_t>(type)].append(&widget);
  if (size == 0) return {widgetCount, false};
  // After a removal two widgets of a layer have the same number.
  widget.setId(size);
  ++widget.registrations;
  return {++widgetCount, true};
}

void Layers::leaveById(Widget& widget) {
  const int type = widget.type();
  Widget* removed = nullptr;
  int count = 0;
  bool gone = false;
  {
    const std::lock_guard guard(lock);
    if (isLayer(type)) removed = layers[static_cast<std::size_t>(type)].removeFirst(widget.id());
    if (removed != nullptr) --removed->registrations;
    count = --widgetCount;
    gone = widget.registrations == 0;
  }
  logCount(count);
  if (removed != nullptr) LayerWalk::waitUntilNotCalled(removed);
  // It may have left by another thread's removal that is still waiting.
  if (gone && removed != &widget) LayerWalk::waitUntilNotCalled(&widget);
}

void Layers::leave(Widget& widget, Count count) {
  int lowered = 0;
  {
    const std::lock_guard guard(lock);
    for (Layer& each : layers) {
      if (widget.registrations == 0) break;
      widget.registrations -= each.removeAll(&widget);
    }
    if (count == Count::Lowered) lowered = --widgetCount;
  }
  if (count == Count::Lowered) logCount(lowered);
  LayerWalk::waitUntilNotCalled(&widget);
}

void Layers::logCount(int count) {
  kLog.print(LogLevel::Debug, "unregisterWidget: num_widget=%d", count);
}

}  // namespace MW
