/// A text file that grows line by line.
#pragma once

#include <fstream>
#include <string>

namespace brimol::pc {

/// Each line is in the file as soon as it is written. Not guarded. Where the disk takes no more,
/// one line on stderr says so, and the file ends there.
class LineFile {
 public:
  /// Begins the file anew. `error` says in one line why it cannot be written.
  LineFile(std::string path, std::string& error);

  void write(const std::string& line);

 private:
  std::string name;
  std::ofstream file;
};

}  // namespace brimol::pc
