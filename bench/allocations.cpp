// The program's own malloc and its like come before the C library's, to which they leave the work.
// So the calls of every library count.
#include "allocations.h"

#include <atomic>
#include <cstddef>

namespace {
std::atomic<uint64_t> calls = 0;
}

uint64_t allocationCount() { return calls; }

extern "C" {

// The C library's own, by the names under which it offers them to others that stand in front.
void* libraryMalloc(std::size_t size) __asm__("__libc_malloc");
void* libraryCalloc(std::size_t count, std::size_t size) __asm__("__libc_calloc");
void* libraryRealloc(void* memory, std::size_t size) __asm__("__libc_realloc");

[[gnu::visibility("default")]] void* malloc(std::size_t size) {
  ++calls;
  return libraryMalloc(size);
}

[[gnu::visibility("default")]] void* calloc(std::size_t nmemb, std::size_t size) {
  ++calls;
  return libraryCalloc(nmemb, size);
}

[[gnu::visibility("default")]] void* realloc(void* ptr, std::size_t size) {
  ++calls;
  return libraryRealloc(ptr, size);
}
}
