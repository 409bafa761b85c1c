/// The memory that a process keeps in use.
#pragma once

#include <unistd.h>

#include <fstream>

/// Of this process, in kilobytes, with what it shares with others.
inline long residentKb() {
  constexpr long kKilobyte = 1024;
  long size = 0;
  long resident = 0;
  std::ifstream("/proc/self/statm") >> size >> resident;
  return resident * (::sysconf(_SC_PAGESIZE) / kKilobyte);
}
