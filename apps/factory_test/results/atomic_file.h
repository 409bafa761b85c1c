/// A file that is replaced as a whole or not at all.
#pragma once

#include <cstddef>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

#include "results/file_lock.h"
#include "results/file_text.h"

namespace factory_test {

/// Owns a file, which need not exist yet, for as long as the object lives: a second owner is
/// refused, in this program or another. At every moment the file holds all of one replace(). What
/// a killed owner left beside it, the next one removes. One thread at a time uses it.
class AtomicFile {
 public:
  /// Follows symbolic links and owns the file that they lead to. Nothing if that is in use, or its
  /// directory is missing or cannot be written to; `error` then says so in one line.
  /// More bytes than `mostBytes` are neither read nor written.
  static std::optional<AtomicFile> own(const std::filesystem::path& path, std::size_t mostBytes,
                                       std::string& error);

  FileText read() const { return readFile(file, limit); }

  /// Puts `bytes` in the place of what it holds, on the disk too. The new file has the old one's
  /// permissions; other hard links keep the old bytes. False: the file is as it was, and `error`
  /// says why in one line. (If only the directory's entry could not be forced to the disk, that is
  /// a failure too, though the file is new already.)
  bool replace(std::string_view bytes, std::string& error);

 private:
  AtomicFile(std::filesystem::path target, FileLock held, std::size_t mostBytes);

  std::filesystem::path file;
  FileLock lock;
  std::size_t limit;
};

}  // namespace factory_test
