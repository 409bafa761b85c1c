/// Where files stand, with links followed.
#pragma once

#include <algorithm>
#include <filesystem>
#include <system_error>

namespace brimol {

/// Whether `path` is at or below `folder`, wherever links on the way lead. It need not exist. False
/// where that cannot be found out. Empty: the working folder.
inline bool isInside(const std::filesystem::path& folder, const std::filesystem::path& path) {
  namespace fs = std::filesystem;
  std::error_code failure;
  const fs::path root = fs::weakly_canonical(fs::absolute(folder / ".", failure), failure);
  if (failure) return false;
  const fs::path place = fs::weakly_canonical(fs::absolute(path, failure), failure);
  if (failure) return false;
  const fs::path top = root.has_filename() ? root : root.parent_path();
  return std::mismatch(top.begin(), top.end(), place.begin(), place.end()).first == top.end();
}

}  // namespace brimol
