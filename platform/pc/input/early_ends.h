/// Which pauses input ends before their time, so that what it changes is seen at once.
#pragma once

#include <condition_variable>
#include <cstdint>
#include <mutex>

namespace brimol::pc {

/// An input record goes from thread to thread: one polls it, another handles it in rounds with a
/// pause of a millisecond between them, and the application's loop, which pauses for a few, draws
/// what changed. So a record ends three kinds of pauses, one after the other:
///
/// 1. when it arrives, that of the polling thread;
/// 2. when the next poll tells that it was passed on, those of a millisecond: once for each record,
/// so
///    that a thread which takes one in a round is never behind;
/// 3. when a thread that was woken so pauses again, and has thus handled it, those of up to
///    kLongest milliseconds.
///
/// Not guarded: every operation is called with the lock of InputService.
class EarlyEnds {
 public:
  static constexpr uint32_t kLongest = 20;  ///< longer pauses always last their time, in ms

  EarlyEnds();

  /// The polling thread asks for a record; `isGiven`: it gets one.
  void hearOfPoll(bool isGiven);
  /// What was given before is forgotten.
  void reset() { isPassing = false; }

  /// What the calling thread waits for in a pause that begins now.
  class Pause {
   public:
    /// Tells the others what this thread has done since its pause before.
    Pause(EarlyEnds& ends, uint32_t ms);
    bool isOver() const;
    std::condition_variable& wake() const;
    /// The pause is over because isOver() is.
    void endEarly();
    /// Whether others must be given some time before it ends early: whoever draws after each record
    /// of a flood is no faster for it.
    bool isBounded() const { return kind == Kind::Loop; }

   private:
    enum class Kind { Worker, Loop, Long };
    EarlyEnds& all;
    Kind kind;
  };

  void wakeAll();

 private:
  struct Seen;  // by one thread
  static Seen& seenHere(const EarlyEnds& ends);

  const uint64_t id;  // tells one from another that had its place in memory
  uint64_t passedOn = 0;
  uint64_t handled = 0;
  bool isPassing = false;  // the polling thread has a record that it may not have passed on yet
  std::condition_variable passedOnWakes;
  std::condition_variable handledWakes;
};

}  // namespace brimol::pc
