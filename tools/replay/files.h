/// Files that are written whole, or read in part.
#pragma once

#include <filesystem>
#include <functional>
#include <string>

namespace brimol::replay {

/// Lets `write` fill a file beside `file`, which then takes its place: it is whole, or what was
/// there stays. A device does not give way to a file. False: one of the two failed.
bool writeWhole(const std::filesystem::path& file,
                const std::function<bool(const std::filesystem::path& target)>& write);

/// The last bytes of a file, at most so many. Empty: it cannot be read.
std::string endOf(const std::filesystem::path& file, std::size_t most);

}  // namespace brimol::replay
