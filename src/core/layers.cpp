#include "core/layers.h"

#include <MW/widget.h>

namespace MW {

constinit std::mutex Layers::lock;
constinit std::array<Layer, 2> Layers::layers;
constinit int Layers::widgetCount = 0;

const Layer& Layers::layer(int type) { return layers[static_cast<std::size_t>(type)]; }

Layers::Change Layers::enter(Widget& widget) {
  const std::lock_guard guard(lock);
  const int type = widget.type();
  if (!isLayer(type)) return {type, widgetCount, false};
  const int size = layers[static_cast<std::size_t>(type)].append(&widget);
  if (size == 0) return {type, widgetCount, false};
  // The number is the layer's size, and so no longer unique after a removal: meant so.
  widget.setId(size);
  ++widget.registrations;
  return {type, ++widgetCount, true};
}

Layers::Change Layers::leaveById(Widget& widget) {
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
  if (removed != nullptr) LayerWalk::waitUntilNotCalled(removed);
  // It may have left by another thread's removal that is still waiting.
  if (gone && removed != &widget) LayerWalk::waitUntilNotCalled(&widget);
  return {type, count, removed != nullptr};
}

void Layers::leave(Widget& widget) {
  {
    const std::lock_guard guard(lock);
    for (Layer& each : layers) {
      if (widget.registrations == 0) break;
      widget.registrations -= each.removeAll(&widget);
    }
  }
  LayerWalk::waitUntilNotCalled(&widget);
}

}  // namespace MW
