#include "results/file_lock.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>

#include <cerrno>

#include "results/file_text.h"

namespace factory_test {

namespace {

constexpr mode_t kLockMode = 0666;
constexpr int kAttempts = 100;

enum class Attempt { Taken, OwnerLeft, Failed };

// An owner that leaves removes the file: what was locked then is no longer the one in the
// directory.
Attempt lockOnce(const std::filesystem::path& lockFile, UniqueFd& descriptor) {
  // Reading is enough for a lock, so that a leftover of another user is no obstacle.
  descriptor =
      UniqueFd(::open(lockFile.c_str(), O_RDONLY | O_CREAT | O_CLOEXEC | O_NOFOLLOW, kLockMode));
  if (!descriptor.isOpen() || ::flock(descriptor.get(), LOCK_EX | LOCK_NB) != 0) {
    return Attempt::Failed;
  }
  struct stat locked = {};
  if (::fstat(descriptor.get(), &locked) != 0) return Attempt::Failed;
  return locked.st_nlink > 0 ? Attempt::Taken : Attempt::OwnerLeft;
}

}  // namespace

FileLock::FileLock(const std::filesystem::path& file, std::string& error)
    : lockFile(hiddenSibling(file, ".lock")) {
  errno = 0;
  auto attempt = Attempt::OwnerLeft;
  for (int i = 0; i < kAttempts && attempt == Attempt::OwnerLeft; ++i) {
    attempt = lockOnce(lockFile, descriptor);
  }
  if (attempt == Attempt::Taken) return;
  const bool isTaken = attempt == Attempt::OwnerLeft || errno == EWOULDBLOCK;
  error = fileError(file, isTaken ? "is in use already"
                                  : "no lock can be made beside it: " + systemReason(errno));
  descriptor = UniqueFd();
}

FileLock::~FileLock() { release(); }

FileLock& FileLock::operator=(FileLock&& other) noexcept {
  if (this == &other) return *this;
  release();
  lockFile = std::move(other.lockFile);
  descriptor = std::move(other.descriptor);
  return *this;
}

void FileLock::release() {
  if (!isHeld()) return;
  ::unlink(lockFile.c_str());  // before the lock ends: afterwards it may be another owner's
  descriptor.close();
}

}  // namespace factory_test
