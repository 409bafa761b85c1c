/// The input records that wait to be taken.
#pragma once

#include <brimol/input.h>

#include <cstddef>
#include <deque>

namespace brimol::pc {

/// Records in the order of their arrival, at most `capacity` of them. Not guarded: InputService is.
///
/// A motion of a finger whose motion waits already becomes one with that, their relative motions
/// added, unless anything but motions came between. So a reader that is late is never further
/// behind.
///
/// A full queue takes a record all the same and drops another one: the oldest motion of the same
/// finger; else the oldest motion; else the oldest record that is neither a down nor an up; else
/// the oldest press together with its release. So the release of a press that was seen always
/// arrives. The relative motion of a dropped record is added to the finger's next motion.
class InputQueue {
 public:
  static constexpr std::size_t kCapacity = 1024;

  /// `maxRecords` is more than two for each finger and key that can be down at once.
  explicit InputQueue(std::size_t maxRecords = kCapacity) : capacity(maxRecords) {}

  void push(const Event& record);
  /// Moves the oldest record to `record`. False, and `record` stays as it is, when none waits.
  bool take(Event& record);
  bool isEmpty() const { return records.empty(); }
  std::size_t size() const { return records.size(); }
  void clear() { records.clear(); }

 private:
  using Place = std::deque<Event>::iterator;
  bool mergeWithWaiting(const Event& motion);
  void makeRoom();
  void dropMotion(Place motion);
  void dropOldestPress();

  std::size_t capacity;
  std::deque<Event> records;
};

}  // namespace brimol::pc
