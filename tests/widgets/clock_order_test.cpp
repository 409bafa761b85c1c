#include <MW/detail/clock_order.h>

namespace {

// Each time is earlier than the next, and neither later than itself.
constexpr bool areInOrder(uint32_t first, uint32_t second) {
  return MW::isLater(second, first) && !MW::isLater(first, second) && !MW::isLater(first, first);
}
static_assert(areInOrder(0, 1) && areInOrder(1000, 1250) && areInOrder(~1U, ~0U));
static_assert(areInOrder(0, 0x7FFFFFFF) && areInOrder(0x7FFFFFFF, 0x80000000), "farthest, middle");
static_assert(areInOrder(~0U, 0) && areInOrder(~15U, 234) && areInOrder(~0U, 0x7FFFFFFE), "wrap");

// A second before it began a time is not over, farther back it is.
static_assert(!MW::isOver(1, 1006, 5) && MW::isOver(1, 1007, 5) && MW::isOver(0, 5000, 5));
static_assert(MW::lengthOf(7) == 7 && MW::lengthOf(-7) == 0);

}  // namespace
