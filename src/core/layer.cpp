#include "core/layer.h"

#include <MW/widget.h>

#include <algorithm>
#include <new>

#include "core/layer_walk.h"

namespace MW {

namespace {
constexpr std::size_t kSmallestBlock = 16;
}

std::unique_ptr<WidgetBlock> WidgetBlock::make(std::size_t capacity) {
  std::unique_ptr<WidgetBlock> block(new (std::nothrow) WidgetBlock);
  if (!block) return nullptr;
  block->places.reset(new (std::nothrow) std::atomic<Widget*>[capacity]);
  if (!block->places) return nullptr;
  block->capacity = capacity;
  return block;
}

int Layer::append(Widget* widget) {
  const WidgetBlock* const full = current;
  if ((full == nullptr || full->used == full->capacity) && !renew()) return 0;
  WidgetBlock& block = *current;
  block.places[block.used] = widget;
  ++block.used;
  return ++live;
}

// A new block takes over the widgets that are left. The walks that go over the old one keep it.
bool Layer::renew() {
  auto wider = WidgetBlock::make(std::max(kSmallestBlock, static_cast<std::size_t>(live) * 2));
  if (!wider) return false;
  if (WidgetBlock* const old = current) {
    for (std::size_t i = 0; i < old->used; ++i) {
      if (Widget* const widget = old->places[i]) wider->places[wider->used++] = widget;
    }
    wider->older.reset(old);
  }
  current = wider.release();
  freeOlderBlocks();
  return true;
}

// Cleared places cost every walk time. Without memory for a new block they stay.
void Layer::dropClearedPlaces() {
  const auto widgets = static_cast<std::size_t>(live);
  if (current.load()->used > 2 * widgets + kSmallestBlock) (void)renew();
}

void Layer::freeOlderBlocks() {
  std::unique_ptr<WidgetBlock>* link = &current.load()->older;
  while (*link) {
    if (LayerWalk::isPinned(link->get())) {
      link = &(*link)->older;
    } else {
      *link = std::move((*link)->older);
    }
  }
}

// The same registration is the first one of its widget in every block: blocks keep the order, and
// removals take the first.
void Layer::clear(const Widget* widget) {
  for (WidgetBlock* block = current; block != nullptr; block = block->older.get()) {
    const auto begin = block->places.get();
    const auto found = std::find(begin, begin + block->used, widget);
    if (found != begin + block->used) *found = nullptr;
  }
  --live;
}

// Of the block that new walks go over.
std::span<std::atomic<Widget*>> Layer::filledPlaces() const {
  const WidgetBlock* const block = current;
  if (block == nullptr) return {};
  return {block->places.get(), block->used};
}

Widget* Layer::removeFirst(int id) {
  for (Widget* const widget : filledPlaces()) {
    if (widget == nullptr || widget->id() != id) continue;
    clear(widget);
    dropClearedPlaces();
    return widget;
  }
  return nullptr;
}

int Layer::removeAll(const Widget* widget) {
  int removed = 0;
  for (const Widget* const each : filledPlaces()) {
    if (each != widget) continue;
    clear(widget);
    ++removed;
  }
  if (removed > 0) dropClearedPlaces();
  return removed;
}

}  // namespace MW
