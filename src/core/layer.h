/// A layer of live widgets, and the walks over it.
#pragma once

#include <atomic>
#include <cstddef>
#include <memory>
#include <thread>

namespace MW {

class Widget;

/// What one walk tells the threads that change layers. Records are handed from walk to walk and
/// never freed, so that they can be read at any time.
struct WalkRecord;

/// A fixed number of places that are filled from the front. A place that was filled is cleared when
/// its widget leaves and is not used again, so that a walk can go on while others write.
struct WidgetBlock {
  static std::unique_ptr<WidgetBlock> make(std::size_t capacity);  // null: no memory

  // NOLINTNEXTLINE(modernize-avoid-c-arrays): a vector would throw where there is no memory
  std::unique_ptr<std::atomic<Widget*>[]> places;
  std::size_t capacity = 0;
  std::atomic<std::size_t> used = 0;
  std::unique_ptr<WidgetBlock> older;  // blocks that a walk may still go over
};

/// Widgets in the order of registering; one may stand in it several times.
///
/// Changes are made under the layer lock. Walks take no lock: they go over the block that was
/// current when they began. A removal clears the widget's place in every block that a walk may go
/// over, needs no memory, and so cannot fail; with memory it also makes room when many are cleared.
class Layer {
 public:
  /// The number of widgets it then holds, or 0 when there was no memory.
  int append(Widget* widget);
  /// The first widget of that id, which leaves; null when there is none.
  Widget* removeFirst(int id);
  /// Takes out every entry of the widget and returns how many there were.
  int removeAll(const Widget* widget);

  /// Any thread.
  bool isEmpty() const { return live == 0; }

 private:
  friend class LayerWalk;

  bool renew();
  void clear(std::size_t place);
  void dropClearedPlaces();
  void freeOlderBlocks();

  // Walks pin a block before they read it (LayerWalk); the chain of older blocks hangs on it.
  // Never freed: widgets may leave as late as at the end of the program.
  std::atomic<WidgetBlock*> current = nullptr;
  std::atomic<int> live = 0;
};

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

  /// Waits until no other thread calls the widget, which must have left the layers. Returns at once
  /// where the caller of that widget waits, itself or through others, for one that this thread is
  /// calling: neither could ever go on.
  static void waitUntilNotCalled(const Widget* widget);

 private:
  WalkRecord* record;  // null where there was no memory for one: the walk meets no widget
  const WidgetBlock* block = nullptr;
  std::size_t position = 0;
  std::size_t end = 0;
};

}  // namespace MW
