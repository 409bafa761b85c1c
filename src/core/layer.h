/// A layer of live widgets.
#pragma once

#include <atomic>
#include <cstddef>
#include <memory>
#include <span>

namespace MW {

class Widget;

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
  std::span<std::atomic<Widget*>> filledPlaces() const;
  void clear(const Widget* widget);
  void dropClearedPlaces();
  void freeOlderBlocks();

  // Walks pin a block before they read it (LayerWalk); the chain of older blocks hangs on it.
  // Never freed: widgets may leave as late as at the end of the program.
  std::atomic<WidgetBlock*> current = nullptr;
  std::atomic<int> live = 0;
};

}  // namespace MW
