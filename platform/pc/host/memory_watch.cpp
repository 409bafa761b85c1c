#include "host/memory_watch.h"

#include <malloc.h>
#include <unistd.h>

#include <algorithm>
#include <fstream>

namespace brimol::pc {

namespace {

// Without what is free and was not given back, which depends on what was done last.
long residentKib() {
  constexpr long kKibi = 1024;
  (void)::malloc_trim(0);
  std::ifstream file("/proc/self/statm");
  long all = 0;
  long resident = 0;
  file >> all >> resident;
  return resident * (sysconf(_SC_PAGESIZE) / kKibi);
}

}  // namespace

void MemoryWatch::look() { looks.at(count++ % looks.size()) = residentKib(); }

long MemoryWatch::least() const {
  const auto end = looks.begin() + static_cast<std::ptrdiff_t>(std::min(count, looks.size()));
  return end == looks.begin() ? 0 : *std::min_element(looks.begin(), end);
}

}  // namespace brimol::pc
