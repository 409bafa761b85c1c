#include "core/layer_walk.h"

#include <MW/widget.h>

#include <array>
#include <atomic>
#include <cstdint>
#include <mutex>
#include <new>

#include "core/layer.h"

namespace MW {

namespace {

// What threads are told apart by. A std::thread::id is not there before the program runs.
struct ThreadMark {};
using ThreadId = const ThreadMark*;

thread_local constinit ThreadMark ownMark;
ThreadId thisThread() { return &ownMark; }

}  // namespace

struct WalkRecord {
  // Not null: a walk has the record, and this block is not freed.
  std::atomic<const WidgetBlock*> pinned = nullptr;
  std::atomic<ThreadId> thread = nullptr;        // the walking one
  std::atomic<const Widget*> calling = nullptr;  // its handler runs, or is about to
  std::atomic<int> waiting = 0;                  // threads that wait for a call of this walk to end
  std::atomic<uint32_t> turn = 0;                // counts the calls while anybody waits
  WalkRecord* next = nullptr;

  // Goes on to the next call. The address is written before `waiting` is read; who waits raises
  // `waiting` before it reads the address, so that one of the two sees the other.
  void nextTurn(const Widget* widget) {
    calling = widget;
    if (waiting == 0) return;
    ++turn;
    turn.notify_all();
  }
};

namespace {

constexpr std::size_t kFirstRecords = 8;  // drawing, timing and dispatch, each within the others

constinit std::array<WalkRecord, kFirstRecords> firstRecords;
constinit std::atomic<WalkRecord*> addedRecords = nullptr;  // grows at the front, never shrinks

// The first record that `matches` takes, or null.
template <typename Matches>
WalkRecord* findRecord(Matches matches) {
  for (WalkRecord& record : firstRecords) {
    if (matches(record)) return &record;
  }
  WalkRecord* record = addedRecords;
  while (record != nullptr && !matches(*record)) record = record->next;
  return record;
}

// A record that pins the block. Null: no memory.
WalkRecord* takeRecord(const WidgetBlock* block) {
  WalkRecord* const unused = findRecord([block](WalkRecord& record) {
    const WidgetBlock* none = nullptr;
    return record.pinned == none && record.pinned.compare_exchange_strong(none, block);
  });
  if (unused != nullptr) return unused;
  auto* const added = new (std::nothrow) WalkRecord;
  if (added == nullptr) return nullptr;
  added->pinned = block;
  added->next = addedRecords;
  while (!addedRecords.compare_exchange_weak(added->next, added)) {
  }
  return added;
}

// One call of a handler, seen by a thread that is counted as waiting.
struct Call {
  WalkRecord* record;
  uint32_t turn;
  ThreadId thread;

  bool isOver() const { return record->turn != turn; }
};

// A thread that waits for a call to end. Stands on its stack.
struct Wait {
  ThreadId thread;
  Call call;
  Wait* next = nullptr;
};

constinit std::mutex waitsLock;
constinit Wait* waits = nullptr;  // guarded by waitsLock

const Wait* waitOf(ThreadId thread) {
  const Wait* wait = waits;
  while (wait != nullptr && (wait->thread != thread || wait->call.isOver())) wait = wait->next;
  return wait;
}

// Whether `thread` can go on only after `other` has. A thread waits for one call at a time, and no
// wait that closes a circle is ever begun, so that this follows a chain to its end.
bool isBehind(ThreadId thread, ThreadId other) {
  const Wait* wait = waitOf(thread);
  while (wait != nullptr && wait->call.thread != other) wait = waitOf(wait->call.thread);
  return wait != nullptr;
}

// False: it would wait in a circle.
bool beginWait(Wait& wait) {
  const std::lock_guard guard(waitsLock);
  if (isBehind(wait.call.thread, wait.thread)) return false;
  wait.next = waits;
  waits = &wait;
  return true;
}

void endWait(const Wait& wait) {
  const std::lock_guard guard(waitsLock);
  Wait** link = &waits;
  while (*link != &wait) link = &(*link)->next;
  *link = wait.next;
}

void waitForEnd(const Call& call) {
  Wait wait = {thisThread(), call};
  if (!beginWait(wait)) return;
  call.record->turn.wait(call.turn);
  endWait(wait);
}

bool isCalledElsewhere(const WalkRecord& record, const Widget* widget) {
  return record.calling == widget && record.thread != thisThread();
}

void waitForCall(WalkRecord& record, const Widget* widget) {
  if (!isCalledElsewhere(record, widget)) return;
  ++record.waiting;
  const uint32_t turn = record.turn;
  if (isCalledElsewhere(record, widget)) {
    const Call call = {&record, turn, record.thread};
    if (!call.isOver()) waitForEnd(call);
  }
  --record.waiting;
}

}  // namespace

LayerWalk::LayerWalk(const Layer& layer)
    : block(layer.current), record(block != nullptr ? takeRecord(block) : nullptr) {
  if (record == nullptr) return;
  record->thread = thisThread();
  // Pinned first and compared then: a block that is still current was not freed before it was
  // pinned, and is not freed while it is.
  while (layer.current != block) {
    block = layer.current;
    record->pinned = block;
  }
  end = block->used;
}

// Released in this order: whoever reads one of them sees everything that this walk did before.
LayerWalk::~LayerWalk() {
  if (record == nullptr) return;
  if (position > 0) record->nextTurn(nullptr);
  record->thread.store(nullptr, std::memory_order_release);
  record->pinned.store(nullptr, std::memory_order_release);
}

Widget* LayerWalk::next() {
  while (position < end) {
    const std::atomic<Widget*>& place = block->places[position++];
    Widget* const widget = place;
    if (widget == nullptr) continue;
    // Published first and compared then. A thread that removes the widget clears the place first
    // and reads this then, so that at least one of the two sees the other.
    record->nextTurn(widget);
    if (place == widget) return widget;
  }
  return nullptr;
}

bool LayerWalk::isOnThisThread() {
  return findRecord([](const WalkRecord& each) { return each.thread == thisThread(); }) != nullptr;
}

bool LayerWalk::isPinned(const WidgetBlock* block) {
  return findRecord([block](const WalkRecord& each) { return each.pinned == block; }) != nullptr;
}

void LayerWalk::waitUntilNotCalled(const Widget* widget) {
  findRecord([widget](WalkRecord& each) {
    waitForCall(each, widget);
    return false;
  });
}

void LayerWalk::forget(const Widget* widget) {
  findRecord([widget](WalkRecord& each) {
    const Widget* ended = widget;
    if (each.calling == ended) each.calling.compare_exchange_strong(ended, nullptr);
    return false;
  });
}

}  // namespace MW
