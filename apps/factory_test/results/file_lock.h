/// One program at a time on a file.
#pragma once

#include <filesystem>
#include <optional>
#include <string>

namespace factory_test {

/// Holds FILE.lock beside a file, from take() to destruction or to the program's end, however that
/// comes: the kernel lets go of it. The lock file goes with its holder; one that a killed program
/// left does no harm.
class FileLock {
 public:
  /// The lock of `file`, of the file that it leads to for a symbolic link. Nothing, with `error` in
  /// one line, where another program holds it or no lock file can be made. A symbolic link of that
  /// name, and a file that holds more than a process's number, stay as they are: nothing, too.
  static std::optional<FileLock> take(const std::filesystem::path& file, std::string& error);

  FileLock(FileLock&& other) noexcept;
  FileLock& operator=(FileLock&&) = delete;
  FileLock(const FileLock&) = delete;
  FileLock& operator=(const FileLock&) = delete;
  ~FileLock();

 private:
  FileLock(std::filesystem::path lockFile, int openFile);

  std::filesystem::path path;
  int descriptor;  // negative: moved away
};

}  // namespace factory_test
