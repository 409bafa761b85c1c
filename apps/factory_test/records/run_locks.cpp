#include "records/run_locks.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>

#include "records/sqlite.h"
#include "results/system_words.h"
#include "results/whole_file.h"

namespace factory_test {

namespace {

constexpr mode_t kMode = 0666;  // less what the user's mask takes

struct flock byteOf(std::int64_t run, short kind) {
  struct flock lock = {};
  lock.l_type = kind;
  lock.l_whence = SEEK_SET;
  lock.l_start = run;
  lock.l_len = 1;
  return lock;
}

[[noreturn]] void throwUnlockable(const std::filesystem::path& file) {
  throw StoreError(file.native() + ": cannot be locked: " + systemWords(errno));
}

}  // namespace

RunLocks::RunLocks(const std::filesystem::path& database)
    : file(placeOfFile(database).concat(".lock")),
      descriptor(::open(file.c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, kMode)) {
  if (descriptor >= 0) return;
  const std::string reason =
      errno == ELOOP ? "is a symbolic link" : "cannot be written: " + systemWords(errno);
  throw StoreError(file.native() + ": " + reason);
}

RunLocks::~RunLocks() { ::close(descriptor); }

bool RunLocks::isHeld(std::int64_t run) const {
  if (run == own) return true;
  struct flock lock = byteOf(run, F_WRLCK);
  if (::fcntl(descriptor, F_OFD_GETLK, &lock) != 0) throwUnlockable(file);
  return lock.l_type != F_UNLCK;
}

bool RunLocks::take(std::int64_t run) {
  struct flock lock = byteOf(run, F_WRLCK);
  if (::fcntl(descriptor, F_OFD_SETLK, &lock) == 0) {
    own = run;
    return true;
  }
  if (errno != EAGAIN && errno != EACCES) throwUnlockable(file);
  return false;
}

void RunLocks::takeNew(std::int64_t run) {
  if (take(run)) return;
  throw StoreBusy(file.native() + ": another program holds run " + std::to_string(run));
}

void RunLocks::release(std::int64_t run) {
  struct flock lock = byteOf(run, F_UNLCK);
  ::fcntl(descriptor, F_OFD_SETLK, &lock);
  own = 0;
}

}  // namespace factory_test
