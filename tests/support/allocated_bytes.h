/// How much memory the process has from its allocator.
#pragma once

#include <malloc.h>

#include <cstddef>

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
// The sanitizers' own allocator does not count for mallinfo2(), and GCC has no header for this.
extern "C" std::size_t __sanitizer_get_current_allocated_bytes();
#endif

namespace brimol::test {

inline std::size_t allocatedBytes() {
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
  return __sanitizer_get_current_allocated_bytes();
#else
  return mallinfo2().uordblks;
#endif
}

}  // namespace brimol::test
