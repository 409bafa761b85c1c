/// One owner at a time for a file that is replaced on every write.
#pragma once

#include <filesystem>
#include <string>

#include "results/unique_fd.h"

namespace factory_test {

/// Keeps a file for one owner, by the system's lock on a hidden empty file beside it. It ends with
/// the object, which removes that file, or with the program, however that ends. Default constructed
/// it holds nothing.
class FileLock {
 public:
  FileLock() = default;
  /// Takes the lock for `file`, which need not exist. On a failure isHeld() is false and `error`
  /// says why in one line.
  FileLock(const std::filesystem::path& file, std::string& error);
  ~FileLock();
  FileLock(FileLock&& other) noexcept = default;
  FileLock& operator=(FileLock&& other) noexcept;
  FileLock(const FileLock&) = delete;
  FileLock& operator=(const FileLock&) = delete;

  bool isHeld() const { return descriptor.isOpen(); }

 private:
  void release();

  std::filesystem::path lockFile = {};
  UniqueFd descriptor = {};
};

}  // namespace factory_test
