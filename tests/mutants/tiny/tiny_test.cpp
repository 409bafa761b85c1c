#include "src/tiny.h"
#include "include/MW/detail/large.h"

// Nothing is asked about 0.
int main() {
  const bool isWell = countBits(7) == 3 && isNegative(-1) && !isNegative(1) && isLarge(101);
  return isWell && !isLarge(100) && isHuge(101) ? 0 : 1;
}
