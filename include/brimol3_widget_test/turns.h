/// Threads that go on when a test says so.
#pragma once

#include <condition_variable>
#include <list>
#include <mutex>

namespace brimol::test {

/// Holds threads at their pauses and lets them go on one by one.
class Turns {
 public:
  /// From here on a thread that pauses waits for its turn.
  void hold();
  /// Lets all go on, and holds nobody any more.
  void letGo();
  /// Waits until at least so many threads are held. Throws Failure after a minute of real time.
  void await(std::size_t threads);
  /// Gives each held thread one turn, in the order in which they came, if its pause is over at
  /// `now` or is of at most a millisecond, as those of threads are that look for work. A turn goes
  /// to the thread's next pause or its end. Throws Failure for one of over a minute of real
  /// time: a handler that does not come back.
  void give(unsigned int now);

  /// What the platform's Delay does: waits for a turn. False: nobody is held.
  bool pause(unsigned int now, unsigned int ms);
  /// The calling thread ends; it may be the one whose turn it is.
  void end();

 private:
  struct Pause {
    unsigned int until;
    bool isShort;
    bool isOver = false;
  };

  void giveOne(Pause& pause, std::unique_lock<std::mutex>& guard);

  std::mutex lock;  // guards all below
  std::condition_variable changed;
  std::list<Pause*> held;
  bool holds = false;
  bool isAway = false;  // a thread has its turn
};

}  // namespace brimol::test
