/// A list from which the user chooses.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace gallery {

/// Shows the list, by touch or by the keys up, down, select and back, with row `marked` marked, and
/// runs until a row is chosen. Nothing: the user went back, or closed the window.
std::optional<std::size_t> choose(const std::string& title, const std::vector<std::string>& rows,
                                  std::size_t marked);

}  // namespace gallery
