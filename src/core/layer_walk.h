/// Walks over a layer, and the removals that wait for their calls.
#pragma once

#include <cstddef>

namespace MW {

class Layer;
class Widget;
struct WidgetBlock;

/// What one walk tells the threads that change layers. Records are handed from walk to walk and
/// never freed, so that they can be read at any time.
struct WalkRecord;

/// One walk, front to back, over the widgets that stood in the layer when it began.
///
///     LayerWalk walk(layer);
///     while (Widget* widget = walk.next()) { ... }
///
/// The widget that next() returned can be called until the following next() or the walk's end: a
/// thread that removes it waits so long. Widgets that left in the meantime are passed over.
class LayerWalk {
 public:
  explicit LayerWalk(const Layer& layer);
  ~LayerWalk();
  LayerWalk(const LayerWalk&) = delete;
  LayerWalk& operator=(const LayerWalk&) = delete;

  Widget* next();
  /// No memory for it: it meets no widget. Records for a few walks at once are always there.
  bool isRefused() const { return block != nullptr && record == nullptr; }

  /// Whether this thread is inside a walk, and so perhaps inside a widget's handler.
  static bool isOnThisThread();
  static bool isPinned(const WidgetBlock* block);

  /// Waits until the calls of the widget that run on other threads are over. The widget must have
  /// left the layers; where it still stands in one, calls that begin later are not waited for.
  /// Returns at once where the calling thread of the widget waits, itself or through others, for a
  /// call on this thread: neither could ever go on.
  static void waitUntilNotCalled(const Widget* widget);
  /// Takes the address of a widget that ends out of every walk's record: a new widget may get it.
  static void forget(const Widget* widget);

 private:
  const WidgetBlock* block;
  WalkRecord* record;  // null for an empty layer as well
  std::size_t position = 0;
  std::size_t end = 0;
};

}  // namespace MW
