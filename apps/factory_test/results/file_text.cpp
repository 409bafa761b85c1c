#include "results/file_text.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <system_error>

#include "results/unique_fd.h"

namespace factory_test {

namespace {

constexpr unsigned char kFirstPrintable = 0x20;
constexpr unsigned char kDelete = 0x7f;

bool isControl(char letter) {
  const auto byte = static_cast<unsigned char>(letter);
  return byte < kFirstPrintable || byte == kDelete;
}

// Device files in /sys state sizes that are not theirs, so the end is found by reading.
FileText readToEnd(const UniqueFd& descriptor, std::size_t limit) {
  std::string text(limit + 1, '\0');
  std::size_t length = 0;
  while (length < text.size()) {
    const ssize_t count = ::read(descriptor.get(), text.data() + length, text.size() - length);
    if (count < 0 && errno == EINTR) continue;
    if (count < 0) return {{}, systemReason(errno)};
    if (count == 0) break;
    length += static_cast<std::size_t>(count);
  }
  if (length > limit) return {{}, "is longer than " + std::to_string(limit) + " bytes"};
  text.resize(length);
  return {std::move(text), {}};
}

}  // namespace

FileText readFile(const std::filesystem::path& file, std::size_t limit) {
  // Not blocking: a pipe without a writer would be waited for.
  const UniqueFd descriptor(::open(file.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY));
  if (!descriptor.isOpen()) {
    return {{}, errno == ENOENT ? std::string() : systemReason(errno)};
  }
  struct stat status = {};
  if (::fstat(descriptor.get(), &status) != 0) return {{}, systemReason(errno)};
  if (!S_ISREG(status.st_mode)) return {{}, "is not a regular file"};
  return readToEnd(descriptor, limit);
}

std::string fileError(const std::filesystem::path& file, std::string_view reason) {
  std::string line = file.native();
  std::ranges::replace_if(line, isControl, '?');
  return line.append(": ").append(reason);
}

std::string systemReason(int errorNumber) { return std::generic_category().message(errorNumber); }

std::filesystem::path hiddenSibling(const std::filesystem::path& file, std::string_view suffix) {
  std::string name = ".";
  name.append(file.filename().native()).append(suffix);
  return file.parent_path() / name;
}

}  // namespace factory_test
