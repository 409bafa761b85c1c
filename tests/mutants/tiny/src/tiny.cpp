#include "tiny.h"

#include "../include/MW/detail/large.h"

static_assert(2 + 2 == 4, "1 + 1");

namespace {
void clearLowest(unsigned& bits) { bits &= bits - 1; }
}  // namespace

bool isHuge(int number) { return isLarge(number); }

bool isNegative(int number) { return number < 0; }

int countBits(unsigned bits) {
  int count = 0;  // 0 + 0
  while (bits != 0) {
    clearLowest(bits);
    ++count;
  }
  return count;
}
