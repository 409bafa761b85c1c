#include "results/file_lock.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <utility>

#include "results/system_words.h"
#include "results/whole_file.h"

namespace factory_test {

namespace fs = std::filesystem;

namespace {

constexpr mode_t kMode = 0644;
constexpr std::size_t kHolderBytes = 16;

// A holder removes its file: what was waited for may be gone, or be another's by now.
bool isStill(int descriptor, const fs::path& path) {
  struct stat held = {};
  struct stat there = {};
  return ::fstat(descriptor, &held) == 0 && ::stat(path.c_str(), &there) == 0 &&
         held.st_ino == there.st_ino && held.st_dev == there.st_dev;
}

std::string holderOf(int descriptor) {
  std::array<char, kHolderBytes> text = {};
  const ssize_t length = ::pread(descriptor, text.data(), text.size() - 1, 0);
  return length > 0 ? " (process " + std::string(text.data()) + ")" : "";
}

void writeHolder(int descriptor) {
  const std::string text = std::to_string(::getpid());
  // Only a message loses by it where the disk is full.
  const bool isCut = ::ftruncate(descriptor, 0) == 0;
  const ssize_t written = isCut ? ::pwrite(descriptor, text.data(), text.size(), 0) : 0;
  static_cast<void>(written);
}

// The open, locked file; negative, with why in `reason`.
int lock(const fs::path& path, std::string& reason) {
  for (;;) {
    const int descriptor = ::open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC, kMode);
    if (descriptor < 0) {
      reason = "cannot be written: " + systemWords(errno);
      return descriptor;
    }
    if (::flock(descriptor, LOCK_EX | LOCK_NB) == 0) {
      if (isStill(descriptor, path)) return descriptor;
      ::close(descriptor);
      continue;
    }
    reason = errno == EWOULDBLOCK ? "is in use by another program" + holderOf(descriptor)
                                  : "cannot be locked: " + systemWords(errno);
    ::close(descriptor);
    return -1;
  }
}

}  // namespace

std::optional<FileLock> FileLock::take(const fs::path& file, std::string& error) {
  const fs::path lockFile = placeOfFile(file).concat(".lock");
  std::string reason;
  const int descriptor = lock(lockFile, reason);
  if (descriptor < 0) {
    error = file.native() + ": " + reason;
    return {};
  }
  writeHolder(descriptor);
  return FileLock(lockFile, descriptor);
}

FileLock::FileLock(fs::path lockFile, int openFile)
    : path(std::move(lockFile)), descriptor(openFile) {}

FileLock::FileLock(FileLock&& other) noexcept
    : path(std::move(other.path)), descriptor(std::exchange(other.descriptor, -1)) {}

FileLock::~FileLock() {
  if (descriptor < 0) return;
  ::unlink(path.c_str());  // while it is held: nobody else can have taken it
  ::close(descriptor);
}

}  // namespace factory_test
