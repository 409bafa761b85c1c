/// How much memory the process has from its allocator.
#pragma once

#include <malloc.h>

#include <cstddef>

// Weak: only there where a sanitizer brings an allocator of its own, which mallinfo2() does not
// count. GCC has no header for it.
// NOLINTNEXTLINE(bugprone-reserved-identifier): the name is the sanitizers'
extern "C" std::size_t __sanitizer_get_current_allocated_bytes() __attribute__((weak));

namespace brimol::test {

inline bool hasSanitizer() { return __sanitizer_get_current_allocated_bytes != nullptr; }

/// Exact only without the allocator's caches of each thread, as CTest runs the unit tests.
inline std::size_t allocatedBytes() {
  return hasSanitizer() ? __sanitizer_get_current_allocated_bytes() : mallinfo2().uordblks;
}

}  // namespace brimol::test
