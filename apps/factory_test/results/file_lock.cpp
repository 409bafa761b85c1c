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
  return ::fstat(descriptor, &held) == 0 && ::lstat(path.c_str(), &there) == 0 &&
         held.st_ino == there.st_ino && held.st_dev == there.st_dev;
}

// The number of the process that holds it, or held it; empty as long as none is written. Nothing
// for a file that holds anything else: it is no lock file, whatever its name.
std::optional<std::string> holderIn(int descriptor) {
  struct stat held = {};
  if (::fstat(descriptor, &held) != 0 || !S_ISREG(held.st_mode)) return {};
  std::array<char, kHolderBytes> text = {};
  const ssize_t length = ::pread(descriptor, text.data(), text.size(), 0);
  if (length < 0 || static_cast<std::size_t>(length) == text.size()) return {};
  std::string holder(text.data(), static_cast<std::size_t>(length));
  if (holder.find_first_not_of("0123456789") != std::string::npos) return {};
  return holder;
}

void writeHolder(int descriptor) {
  const std::string text = std::to_string(::getpid());
  // Only a message loses by it where the disk is full.
  const bool isCut = ::ftruncate(descriptor, 0) == 0;
  const ssize_t written = isCut ? ::pwrite(descriptor, text.data(), text.size(), 0) : 0;
  static_cast<void>(written);
}

// Why the file that is there is not taken.
std::string whyForeign(const fs::path& path) {
  return "cannot be locked: " + path.filename().native() + " is no lock file, and stays as it is";
}

// Why it was not locked.
std::string whyNot(int failure, int descriptor, const fs::path& path) {
  if (failure != EWOULDBLOCK) return "cannot be locked: " + systemWords(failure);
  const auto holder = holderIn(descriptor);
  if (!holder) return whyForeign(path);
  const std::string process = holder->empty() ? "" : " (process " + *holder + ")";
  return "is in use by another program" + process;
}

// The open, locked file; negative, with why in `reason`.
int lock(const fs::path& path, std::string& reason) {
  for (;;) {
    const int descriptor = ::open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, kMode);
    if (descriptor < 0) {
      reason = errno == ELOOP ? whyForeign(path) : "cannot be written: " + systemWords(errno);
      return descriptor;
    }
    const bool isLocked = ::flock(descriptor, LOCK_EX | LOCK_NB) == 0;
    if (!isLocked) {
      reason = whyNot(errno, descriptor, path);
    } else if (isStill(descriptor, path)) {
      if (holderIn(descriptor)) return descriptor;
      reason = whyForeign(path);
    }
    ::close(descriptor);
    if (!reason.empty()) return -1;
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
  // While it is held nobody else can have taken it, but its name may lead to another file by now.
  if (isStill(descriptor, path) && holderIn(descriptor)) ::unlink(path.c_str());
  ::close(descriptor);
}

}  // namespace factory_test
