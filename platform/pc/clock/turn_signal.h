/// How a thread hears that it has the turn.
#pragma once

#include <sched.h>
#include <semaphore.h>

#include <chrono>

namespace brimol::pc {

/// Given once for each wait, by any thread; one thread waits. To give up the processor is the
/// quickest way to the next turn while nobody else wants it, and costs milliseconds a time where
/// somebody does: it is given up only where that took no longer the last time.
class TurnSignal {
 public:
  TurnSignal() { (void)::sem_init(&semaphore, 0, 0); }
  ~TurnSignal() { (void)::sem_destroy(&semaphore); }
  TurnSignal(const TurnSignal&) = delete;
  TurnSignal& operator=(const TurnSignal&) = delete;

  void give() { (void)::sem_post(&semaphore); }

  void wait() {
    for (int i = 0; i < kMostYields && waitsToYield == 0; ++i) {
      if (::sem_trywait(&semaphore) == 0) return;
      yield();
    }
    if (waitsToYield > 0) --waitsToYield;
    while (::sem_wait(&semaphore) != 0) {  // a signal's handler ran
    }
  }

 private:
  static constexpr int kMostYields = 4;
  static constexpr int kWaitsAfterALongYield = 10'000;
  static constexpr std::chrono::microseconds kLongYield{200};

  void yield() {
    const auto start = std::chrono::steady_clock::now();
    (void)::sched_yield();
    if (std::chrono::steady_clock::now() - start > kLongYield) {
      waitsToYield = kWaitsAfterALongYield;
    }
  }

  sem_t semaphore = {};
  int waitsToYield = 0;  // the waiting thread's own
};

}  // namespace brimol::pc
