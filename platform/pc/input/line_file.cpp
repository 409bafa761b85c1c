#include "input/line_file.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <iostream>
#include <string_view>
#include <system_error>
#include <utility>

#include "scene/quoted_text.h"

namespace brimol::pc {

namespace {

namespace fs = std::filesystem;

// What the file takes the place of, or becomes, with links followed; empty for a device, which is
// written itself.
fs::path targetOf(const fs::path& path) {
  std::error_code failure;
  const fs::path target = fs::weakly_canonical(path, failure);
  const bool isOther = fs::exists(target, failure) && !fs::is_regular_file(target, failure);
  return isOther ? fs::path() : target;
}

std::string reason() { return std::generic_category().message(errno); }

}  // namespace

LineFile::LineFile(std::string path, std::string& error)
    : name(std::move(path)), target(targetOf(name)) {
  std::error_code failure;
  const bool replaces = !target.empty() && fs::exists(target, failure);
  if (!target.empty()) unfinished = fs::path(target).concat(".part");
  if (!replaces || ::access(target.c_str(), W_OK) == 0) {
    open(unfinished.empty() ? fs::path(name) : unfinished);
  }
  if (file < 0) error = printable(name) + ": " + reason();
}

LineFile::~LineFile() { close(); }

void LineFile::open(const fs::path& path) {
  constexpr mode_t kMode = 0666;
  const int opened = ::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, kMode);
  if (opened < 0 || opened > STDERR_FILENO) {
    file = opened;
    return;
  }
  file = ::fcntl(opened, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
  const int problem = errno;
  ::close(opened);
  errno = problem;
}

void LineFile::write(const std::string& line) {
  if (file < 0 || (writeAll(line + '\n') && takePlace())) return;
  std::cerr << "brimol: " << printable(name) << ": " << reason()
            << "; what comes from here on is not written\n";
  close();
}

bool LineFile::writeAll(std::string_view bytes) const {
  while (!bytes.empty()) {
    const ssize_t written = ::write(file, bytes.data(), bytes.size());
    if (written < 0 && errno != EINTR) return false;
    if (written > 0) bytes.remove_prefix(static_cast<std::size_t>(written));
  }
  return true;
}

bool LineFile::takePlace() {
  if (unfinished.empty()) return true;
  std::error_code failure;  // it then has those of a new file
  const fs::perms former = fs::status(target, failure).permissions();
  if (!failure && former != fs::perms::unknown) fs::permissions(unfinished, former, failure);
  if (std::rename(unfinished.c_str(), target.c_str()) != 0) return false;
  unfinished.clear();
  return true;
}

void LineFile::close() {
  if (file < 0) return;
  ::close(std::exchange(file, -1));
  if (!unfinished.empty()) std::remove(unfinished.c_str());
}

}  // namespace brimol::pc
