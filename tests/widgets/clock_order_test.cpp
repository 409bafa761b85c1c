#include <MW/detail/clock_order.h>

namespace {

// Each time is earlier than the next, and neither later than itself.
constexpr bool areInOrder(uint32_t first, uint32_t second) {
  return MW::isLater(second, first) && !MW::isLater(first, second) && !MW::isLater(first, first);
}
static_assert(areInOrder(0, 1) && areInOrder(1000, 1250) && areInOrder(~1U, ~0U));
static_assert(areInOrder(0, 0x7FFFFFFF) && areInOrder(0x7FFFFFFF, 0x80000000), "farthest, middle");
static_assert(areInOrder(~0U, 0) && areInOrder(~15U, 234) && areInOrder(~0U, 0x7FFFFFFE), "wrap");

}  // namespace
