/// A text file that grows line by line.
#pragma once

#include <filesystem>
#include <string>

namespace brimol::pc {

/// Each line is in the file as soon as it is written. Not guarded. Where the disk takes no more,
/// one line on stderr says so, and the file ends there. Up to its first line the file stands as
/// FILE.part, so that one of its name stays as it is, and goes with this object. Programs that the
/// process starts do not get it, and standard output and error are not it, even if they are closed.
class LineFile {
 public:
  /// Begins the file anew. `error` says in one line why it cannot be written.
  LineFile(std::string path, std::string& error);
  ~LineFile();
  LineFile(const LineFile&) = delete;
  LineFile& operator=(const LineFile&) = delete;

  void write(const std::string& line);

 private:
  void open(const std::filesystem::path& path);
  bool writeAll(std::string_view bytes) const;
  bool takePlace();
  void close();

  std::string name;
  std::filesystem::path target;
  std::filesystem::path unfinished;  // empty: the file stands in its place
  int file = -1;
};

}  // namespace brimol::pc
