/// Lets a chosen allocation fail. Programs that link failing_malloc.cpp get their malloc and
/// operator new from there; it forwards to the ones behind.
#pragma once

namespace brimol::test {

inline thread_local constinit int allocationsLeft = 0;  // until the one that fails; 0: none does

/// While it lives, the `nth` allocation (from 1) of this thread fails, once. One at a time.
class FailingAllocation {
 public:
  explicit FailingAllocation(int nth) { allocationsLeft = nth; }
  ~FailingAllocation() { allocationsLeft = 0; }
  FailingAllocation(const FailingAllocation&) = delete;
  FailingAllocation& operator=(const FailingAllocation&) = delete;

  /// Whether the next one is it.
  static bool isNext() { return allocationsLeft == 1; }
  /// Whether it came to that.
  static bool hasFailed() { return allocationsLeft == 0; }
};

}  // namespace brimol::test
