/// How often a program asks for memory.
#pragma once

#include <cstdint>

/// Calls of malloc and its like so far, of all threads and libraries.
uint64_t allocationCount();
