#include "results/whole_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <fstream>
#include <system_error>

#include "language/language.h"
#include "results/system_words.h"

namespace factory_test {

namespace fs = std::filesystem;

namespace {

// Why it cannot be read; empty: it stands in `bytes`.
std::string readInto(std::string& bytes, const fs::path& file, std::size_t mostMiB) {
  constexpr uintmax_t kMiB = uintmax_t{1} << 20;
  std::error_code failure;
  const auto status = fs::status(file, failure);
  if (failure) return systemWords(failure.value());
  if (!fs::is_regular_file(status)) return "is not a regular file";
  const uintmax_t size = fs::file_size(file, failure);
  if (size > mostMiB * kMiB) {
    return "is longer than " + (mostMiB == 1 ? std::string("a") : std::to_string(mostMiB)) + " MiB";
  }
  std::ifstream stream(file, std::ios::binary);
  bytes.resize(size);
  stream.read(bytes.data(), static_cast<std::streamsize>(size));
  bytes.resize(static_cast<std::size_t>(stream.gcount()));  // a device's file is shorter
  return stream.is_open() && !stream.bad() ? "" : "cannot be read";
}

// What a new file may allow whom: as the one whose place it takes, else as the user's mask says.
struct FileMode {
  mode_t bits = 0;
  bool isKept = false;
};

FileMode modeFor(const fs::path& file) {
  constexpr mode_t kUsual = 0666;
  constexpr mode_t kBits = 07777;
  struct stat former = {};
  if (::stat(file.c_str(), &former) != 0) return {kUsual, false};
  return {former.st_mode & kBits, true};
}

// False, with errno set: not all of it is on the disk.
bool writeNewFile(const fs::path& file, std::string_view bytes, FileMode mode) {
  const int descriptor = ::open(file.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode.bits);
  if (descriptor < 0) return false;
  if (mode.isKept) ::fchmod(descriptor, mode.bits);  // what the user's mask took
  std::FILE* const stream = ::fdopen(descriptor, "w");
  if (stream == nullptr) return ::close(descriptor), false;
  const bool isWritten = std::fwrite(bytes.data(), 1, bytes.size(), stream) == bytes.size() &&
                         std::fflush(stream) == 0 && ::fsync(::fileno(stream)) == 0;
  return std::fclose(stream) == 0 && isWritten;
}

}  // namespace

std::optional<std::string> readFile(const fs::path& file, std::string& error, std::size_t mostMiB) {
  std::string bytes;
  const std::string reason = readInto(bytes, file, mostMiB);
  if (reason.empty()) return bytes;
  error = file.native() + ": " + reason;
  return {};
}

bool replaceFile(const fs::path& file, std::string_view bytes, std::string& error) {
  std::error_code failure;
  const bool exists = fs::exists(file, failure);
  if (exists && !fs::is_regular_file(file, failure)) {  // a device must not give way to a file
    error = file.native() + ": " + msg("is not a regular file");
    return false;
  }
  const fs::path target = placeOfFile(file);
  const fs::path temporary = fs::path(target).concat(".tmp");
  ::unlink(temporary.c_str());  // what a killed writer left
  if (writeNewFile(temporary, bytes, modeFor(target)) &&
      ::rename(temporary.c_str(), target.c_str()) == 0) {
    return true;
  }
  error = file.native() + ": " + msg("cannot be written") + ": " + systemWords(errno);
  ::unlink(temporary.c_str());
  return false;
}

std::string readHead(const fs::path& file, std::size_t most) {
  std::error_code failure;
  if (!fs::is_regular_file(file, failure)) return "";
  std::string bytes(most, '\0');
  std::ifstream stream(file, std::ios::binary);
  stream.read(bytes.data(), static_cast<std::streamsize>(most));
  bytes.resize(static_cast<std::size_t>(std::max<std::streamsize>(stream.gcount(), 0)));
  return bytes;
}

fs::path placeOfFile(const fs::path& file) {
  constexpr int kMostLinks = 40;  // as many as the system follows
  std::error_code failure;
  fs::path place = fs::absolute(file, failure);
  for (int link = 0; link < kMostLinks && fs::is_symlink(place, failure); ++link) {
    place = place.parent_path() / fs::read_symlink(place, failure);
  }
  const fs::path straight = fs::weakly_canonical(place, failure);
  return failure ? place : straight;
}

bool isSameFile(const fs::path& one, const fs::path& other) {
  std::error_code failure;
  return fs::equivalent(one, other, failure) || placeOfFile(one) == placeOfFile(other);
}

bool isBeside(const fs::path& file, const fs::path& kept) {
  const auto isIt = [&](const char* ending) {
    return isSameFile(file, placeOfFile(kept).concat(ending));
  };
  return isIt(".tmp") || isIt(".lock");
}

}  // namespace factory_test
