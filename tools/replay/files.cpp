#include "files.h"

#include <algorithm>
#include <fstream>
#include <system_error>

namespace brimol::replay {

namespace fs = std::filesystem;

bool writeWhole(const fs::path& file, const std::function<bool(const fs::path& target)>& write) {
  std::error_code failure;
  const fs::path target = fs::weakly_canonical(file, failure);
  if (failure) return false;
  if (fs::exists(target, failure) && !fs::is_regular_file(target, failure)) return write(target);
  const fs::path temporary = fs::path(target).concat(".tmp");
  const bool isWhole = write(temporary);
  if (isWhole) fs::rename(temporary, target, failure);
  if (isWhole && !failure) return true;
  fs::remove(temporary, failure);
  return false;
}

std::string endOf(const fs::path& file, std::size_t most) {
  std::error_code failure;
  if (!fs::is_regular_file(file, failure)) return {};
  std::ifstream stream(file, std::ios::binary | std::ios::ate);
  const auto size = static_cast<std::streamoff>(stream.tellg());
  if (!stream) return {};
  std::string bytes(std::min(most, static_cast<std::size_t>(size)), '\0');
  stream.seekg(-std::ssize(bytes), std::ios::end);
  stream.read(bytes.data(), std::ssize(bytes));
  bytes.resize(static_cast<std::size_t>(stream.gcount()));
  return bytes;
}

}  // namespace brimol::replay
