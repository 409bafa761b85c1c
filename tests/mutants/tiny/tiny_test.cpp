#include "src/tiny.h"

// Nothing is asked about 0.
int main() { return countBits(7) == 3 && isNegative(-1) && !isNegative(1) ? 0 : 1; }
