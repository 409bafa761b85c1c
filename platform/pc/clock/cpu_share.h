/// One processor for threads of which one runs at a time.
#pragma once

#include <sched.h>

namespace brimol::pc {

/// On one processor a turn goes from thread to thread about ten times as fast as between two.
/// Where the kernel refuses, threads stay where they are. Any thread.
class CpuShare {
 public:
  CpuShare() {
    isKnown = ::sched_getaffinity(0, sizeof everywhere, &everywhere) == 0;
    CPU_ZERO(&shared);
    const int here = ::sched_getcpu();
    if (here >= 0) CPU_SET(static_cast<std::size_t>(here), &shared);
  }
  /// The calling thread joins the others on their processor.
  void join() const {
    if (isKnown) (void)::sched_setaffinity(0, sizeof shared, &shared);
  }
  /// The calling thread runs wherever the first one could; threads inherit where they run.
  void leave() const {
    if (isKnown) (void)::sched_setaffinity(0, sizeof everywhere, &everywhere);
  }

 private:
  bool isKnown = false;
  cpu_set_t everywhere = {};
  cpu_set_t shared = {};
};

}  // namespace brimol::pc
