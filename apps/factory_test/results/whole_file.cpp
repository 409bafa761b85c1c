#include "results/whole_file.h"

#include <unistd.h>

#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <fstream>
#include <system_error>

namespace factory_test {

namespace fs = std::filesystem;

namespace {

constexpr uintmax_t kMostBytes = uintmax_t{1} << 20;

// Why it cannot be read; empty: it stands in `bytes`.
std::string readInto(std::string& bytes, const fs::path& file) {
  std::error_code failure;
  const auto status = fs::status(file, failure);
  if (failure) return failure.message();
  if (!fs::is_regular_file(status)) return "is not a regular file";
  const uintmax_t size = fs::file_size(file, failure);
  if (size > kMostBytes) return "is longer than a MiB";
  std::ifstream stream(file, std::ios::binary);
  bytes.resize(size);
  stream.read(bytes.data(), static_cast<std::streamsize>(size));
  bytes.resize(static_cast<std::size_t>(stream.gcount()));  // a device's file is shorter
  return stream.is_open() && !stream.bad() ? "" : "cannot be read";
}

// False, with errno set: not all of it is on the disk.
bool writeNewFile(const fs::path& file, std::string_view bytes) {
  std::FILE* const stream = std::fopen(file.c_str(), "wxe");
  if (stream == nullptr) return false;
  const bool isWritten = std::fwrite(bytes.data(), 1, bytes.size(), stream) == bytes.size() &&
                         std::fflush(stream) == 0 && ::fsync(::fileno(stream)) == 0;
  return std::fclose(stream) == 0 && isWritten;
}

}  // namespace

std::optional<std::string> readFile(const fs::path& file, std::string& error) {
  std::string bytes;
  const std::string reason = readInto(bytes, file);
  if (reason.empty()) return bytes;
  error = file.native() + ": " + reason;
  return {};
}

bool replaceFile(const fs::path& file, std::string_view bytes, std::string& error) {
  std::error_code failure;
  const bool exists = fs::exists(file, failure);
  if (exists && !fs::is_regular_file(file, failure)) {  // a device must not give way to a file
    error = file.native() + ": is not a regular file";
    return false;
  }
  const fs::path target = exists ? fs::canonical(file, failure) : file;
  const fs::path temporary = fs::path(target).concat(".tmp");
  ::unlink(temporary.c_str());  // what a killed writer left
  if (writeNewFile(temporary, bytes) && ::rename(temporary.c_str(), target.c_str()) == 0) {
    return true;
  }
  error = file.native() + ": cannot be written: " + std::generic_category().message(errno);
  ::unlink(temporary.c_str());
  return false;
}

bool isSameFile(const std::filesystem::path& one, const std::filesystem::path& other) {
  namespace fs = std::filesystem;
  std::error_code failure;
  if (fs::equivalent(one, other, failure)) return true;
  const auto placeOf = [&failure](const fs::path& name) {
    return fs::weakly_canonical(fs::absolute(name, failure), failure);
  };
  return placeOf(one) == placeOf(other);
}

}  // namespace factory_test
