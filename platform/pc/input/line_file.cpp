#include "input/line_file.h"

#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <iostream>
#include <system_error>
#include <utility>

namespace brimol::pc {

namespace {

namespace fs = std::filesystem;

// What a new file takes the place of, with links followed; empty for a device, which is written
// itself.
fs::path replacedBy(const fs::path& path) {
  std::error_code failure;
  const fs::path target = fs::weakly_canonical(path, failure);
  return fs::is_regular_file(target, failure) ? target : fs::path();
}

}  // namespace

LineFile::LineFile(std::string path, std::string& error)
    : name(std::move(path)), replaced(replacedBy(name)) {
  if (!replaced.empty()) unfinished = fs::path(replaced).concat(".part");
  const bool mayReplace = replaced.empty() || ::access(replaced.c_str(), W_OK) == 0;
  if (mayReplace) file.open(unfinished.empty() ? fs::path(name) : unfinished, std::ios::binary);
  if (!file.is_open()) error = name + ": " + std::generic_category().message(errno);
}

void LineFile::write(const std::string& line) {
  if (!file.is_open() || !file) return;
  const bool isWritten = file << line << '\n' << std::flush && takePlace();
  if (isWritten) return;
  std::cerr << "brimol: " << name << ": " << std::generic_category().message(errno)
            << "; what comes from here on is not written\n";
  file.setstate(std::ios::failbit);
  if (!unfinished.empty()) std::remove(unfinished.c_str());
}

bool LineFile::takePlace() {
  if (unfinished.empty()) return true;
  std::error_code failure;  // it then has those of a new file
  fs::permissions(unfinished, fs::status(replaced, failure).permissions(), failure);
  if (std::rename(unfinished.c_str(), replaced.c_str()) != 0) return false;
  unfinished.clear();
  return true;
}

}  // namespace brimol::pc
