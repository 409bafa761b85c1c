#include "core/layer.h"

#include <MW/widget.h>

#include <algorithm>
#include <chrono>
#include <new>

namespace MW {

struct WalkRecord {
  std::atomic<bool> taken = true;
  std::atomic<std::thread::id> thread;
  std::atomic<const WidgetBlock*> pinned = nullptr;  // not freed while it stands here
  std::atomic<const Widget*> calling = nullptr;      // its handler runs, or is about to
  std::atomic<const Widget*> waitingFor = nullptr;   // the walking thread waits for its handler
  WalkRecord* next = nullptr;
};

namespace {

constexpr std::size_t kSmallestBlock = 16;
constexpr int kWaitDepth = 8;  // threads in a chain of waiting ones
constexpr std::chrono::microseconds kWaitPause{50};

std::atomic<WalkRecord*> walkRecords = nullptr;  // grows at the front, never shrinks

// Null: no memory.
WalkRecord* takeRecord() {
  for (WalkRecord* record = walkRecords; record != nullptr; record = record->next) {
    if (!record->taken.exchange(true)) return record;
  }
  auto* const added = new (std::nothrow) WalkRecord;
  if (added == nullptr) return nullptr;
  added->next = walkRecords;
  while (!walkRecords.compare_exchange_weak(added->next, added)) {
  }
  return added;
}

bool isPinned(const WidgetBlock* block) {
  for (const WalkRecord* record = walkRecords; record != nullptr; record = record->next) {
    if (record->pinned == block) return true;
  }
  return false;
}

// Whether a caller of `widget` can go on only after this thread has.
// NOLINTNEXTLINE(misc-no-recursion): as deep as `depth` says
bool waitsForThisThread(const Widget* widget, int depth) {
  if (widget == nullptr || depth == 0) return false;
  for (const WalkRecord* record = walkRecords; record != nullptr; record = record->next) {
    if (record->calling != widget) continue;
    if (record->thread.load() == std::this_thread::get_id()) return true;
    if (waitsForThisThread(record->waitingFor, depth - 1)) return true;
  }
  return false;
}

bool isCalledElsewhere(const WalkRecord& record, const Widget* widget) {
  return record.calling == widget && record.thread.load() != std::this_thread::get_id();
}

void tellWaitingFor(const Widget* widget) {
  for (WalkRecord* record = walkRecords; record != nullptr; record = record->next) {
    if (record->thread.load() == std::this_thread::get_id()) record->waitingFor = widget;
  }
}

void waitForCaller(const WalkRecord& record, const Widget* widget) {
  tellWaitingFor(widget);
  while (isCalledElsewhere(record, widget) && !waitsForThisThread(record.waitingFor, kWaitDepth)) {
    std::this_thread::sleep_for(kWaitPause);
  }
  tellWaitingFor(nullptr);
}

}  // namespace

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
    if (isPinned(link->get())) {
      link = &(*link)->older;
    } else {
      *link = std::move((*link)->older);
    }
  }
}

// The same registration is the first one of its widget in every block: blocks keep the order, and
// removals take the first.
void Layer::clear(std::size_t place) {
  const Widget* const widget = current.load()->places[place];
  for (WidgetBlock* block = current; block != nullptr; block = block->older.get()) {
    const auto begin = block->places.get();
    const auto found = std::find(begin, begin + block->used, widget);
    if (found != begin + block->used) *found = nullptr;
  }
  --live;
}

Widget* Layer::removeFirst(int id) {
  const WidgetBlock* const block = current;
  for (std::size_t i = 0; block != nullptr && i < block->used; ++i) {
    Widget* const widget = block->places[i];
    if (widget == nullptr || widget->id() != id) continue;
    clear(i);
    dropClearedPlaces();
    return widget;
  }
  return nullptr;
}

int Layer::removeAll(const Widget* widget) {
  int removed = 0;
  const WidgetBlock* const block = current;
  for (std::size_t i = 0; block != nullptr && i < block->used; ++i) {
    if (block->places[i] != widget) continue;
    clear(i);
    ++removed;
  }
  if (removed > 0) dropClearedPlaces();
  return removed;
}

LayerWalk::LayerWalk(const Layer& layer) : record(takeRecord()) {
  if (record == nullptr) return;
  record->thread.store(std::this_thread::get_id(), std::memory_order_release);
  // Pinned first and compared then: a block that is still current was not freed before it was
  // pinned, and is not freed while it is.
  do {
    block = layer.current;
    record->pinned = block;
  } while (layer.current != block);
  if (block != nullptr) end = block->used;
}

// Released in this order: whoever reads one of them sees everything that this walk did before.
LayerWalk::~LayerWalk() {
  if (record == nullptr) return;
  record->calling.store(nullptr, std::memory_order_release);
  record->pinned.store(nullptr, std::memory_order_release);
  record->thread.store(std::thread::id(), std::memory_order_release);
  record->taken.store(false, std::memory_order_release);
}

Widget* LayerWalk::next() {
  while (position < end) {
    const std::atomic<Widget*>& place = block->places[position++];
    Widget* const widget = place;
    if (widget == nullptr) continue;
    // Published first and compared then. A thread that removes the widget clears the place first
    // and reads this then, so that at least one of the two sees the other.
    record->calling = widget;
    if (place == widget) return widget;
  }
  if (record != nullptr) record->calling.store(nullptr, std::memory_order_release);
  return nullptr;
}

void LayerWalk::waitUntilNotCalled(const Widget* widget) {
  for (const WalkRecord* record = walkRecords; record != nullptr; record = record->next) {
    if (isCalledElsewhere(*record, widget)) waitForCaller(*record, widget);
  }
}

}  // namespace MW
