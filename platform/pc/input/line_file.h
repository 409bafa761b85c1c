/// A text file that grows line by line.
#pragma once

#include <filesystem>
#include <fstream>
#include <string>

namespace brimol::pc {

/// Each line is in the file as soon as it is written. Not guarded. Where the disk takes no more,
/// one line on stderr says so, and the file ends there. A file that is there already stays as it is
/// until the first line of the new one is written, as FILE.part.
class LineFile {
 public:
  /// Begins the file anew. `error` says in one line why it cannot be written.
  LineFile(std::string path, std::string& error);

  void write(const std::string& line);

 private:
  bool takePlace();

  std::string name;
  std::filesystem::path replaced;    // empty: nothing is
  std::filesystem::path unfinished;  // empty: the file stands in its place
  std::ofstream file;
};

}  // namespace brimol::pc
