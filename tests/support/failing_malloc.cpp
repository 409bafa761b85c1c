#include "support/failing_malloc.h"

#include <dlfcn.h>

#include <bit>
#include <cstdlib>
#include <new>

using brimol::test::allocationsLeft;

namespace {

using Malloc = void* (*)(std::size_t);

// Found at the first allocation, which comes before any thread and before the program's own
// initialisation.
constinit Malloc nextMalloc = nullptr;

}  // namespace

// The sanitizers' own operator new does not go through malloc, so that it is replaced as well.
// They check that what it gave is given back to operator delete: those are replaced, too.

extern "C" __attribute__((visibility("default"))) void* malloc(std::size_t size) noexcept {
  if (nextMalloc == nullptr) nextMalloc = std::bit_cast<Malloc>(dlsym(RTLD_NEXT, "malloc"));
  if (allocationsLeft > 0 && --allocationsLeft == 0) return nullptr;
  return nextMalloc(size);
}

void* operator new(std::size_t size, const std::nothrow_t&) noexcept {
  return std::malloc(size > 0 ? size : 1);
}
void* operator new(std::size_t size) {
  void* const block = operator new(size, std::nothrow);
  if (block == nullptr) throw std::bad_alloc();
  return block;
}
void operator delete(void* block) noexcept { std::free(block); }
void operator delete(void* block, const std::nothrow_t&) noexcept { std::free(block); }
void operator delete(void* block, std::size_t) noexcept { std::free(block); }
