/// One program at a time for a file that is replaced on every write.
#pragma once

#include <filesystem>
#include <string>

#include "results/unique_fd.h"

namespace factory_test {

/// Keeps a file for one owner with a lock on a hidden empty file beside it. The lock ends with the
/// object or with the program, however that ends. Default constructed it holds nothing.
class FileLock {
 public:
  FileLock() = default;
  /// Takes the lock for `file`, which need not exist. On a failure isHeld() is false, and `error`
  /// says in one line why.
  FileLock(const std::filesystem::path& file, std::string& error);
  ~FileLock();
  FileLock(FileLock&& other) noexcept = default;
  FileLock& operator=(FileLock&& other) noexcept;
  FileLock(const FileLock&) = delete;
  FileLock& operator=(const FileLock&) = delete;

  bool isHeld() const { return descriptor.isOpen(); }

 private:
  std::filesystem::path lockFile = {};
  UniqueFd descriptor = {};
};

}  // namespace factory_test
