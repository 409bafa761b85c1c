/// The middle, and the edges, of what was measured.
#pragma once

#include <algorithm>
#include <cstddef>
#include <vector>

/// The value that the given share, 0 to 1, of the values does not exceed. `values` has some, and is
/// put in another order.
inline double percentile(std::vector<double>& values, double share) {
  const auto last = static_cast<double>(values.size() - 1);
  const auto place = values.begin() + static_cast<std::ptrdiff_t>(last * share);
  std::nth_element(values.begin(), place, values.end());
  return *place;
}

inline double median(std::vector<double>& values) {
  constexpr double kHalf = 0.5;
  return percentile(values, kHalf);
}
