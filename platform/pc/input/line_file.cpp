#include "input/line_file.h"

#include <cerrno>
#include <iostream>
#include <system_error>
#include <utility>

namespace brimol::pc {

LineFile::LineFile(std::string path, std::string& error)
    : name(std::move(path)), file(name, std::ios::binary | std::ios::trunc) {
  if (!file) error = name + ": " + std::generic_category().message(errno);
}

void LineFile::write(const std::string& line) {
  if (!file || file << line << '\n' << std::flush) return;
  std::cerr << "brimol: " << name << ": " << std::generic_category().message(errno)
            << "; what comes from here on is not written\n";
}

}  // namespace brimol::pc
