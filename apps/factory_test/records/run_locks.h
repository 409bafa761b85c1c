/// Which runs' programs live.
#pragma once

#include <cstdint>
#include <filesystem>

namespace factory_test {

/// Locks in the file DATABASE.lock, beside the file that a symbolic link leads to, a byte for each
/// run, that the kernel takes from a program when it ends, however it ends: a run whose byte is
/// free has no program any more. That knows no process numbers, so none can come back as another
/// program's. All operations but release() throw StoreError where the system has no locks for the
/// file.
class RunLocks {
 public:
  /// Throws StoreError where the file cannot be opened.
  explicit RunLocks(const std::filesystem::path& database);
  ~RunLocks();
  RunLocks(const RunLocks&) = delete;
  RunLocks& operator=(const RunLocks&) = delete;

  /// Whether a program, which may be this one, holds the run.
  bool isHeld(std::int64_t run) const;
  /// Holds the run from now on. False: somebody else does.
  bool take(std::int64_t run);
  /// As take(); throws StoreBusy where somebody else does.
  void takeNew(std::int64_t run);
  void release(std::int64_t run);

 private:
  const std::filesystem::path file;
  int descriptor;
  std::int64_t own = 0;  // the run that this object holds; 0: none
};

}  // namespace factory_test
