#include "results/atomic_file.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>
#include <cstdio>
#include <system_error>
#include <utility>

#include "results/unique_fd.h"

namespace factory_test {

namespace {

constexpr int kMostLinks = 40;  // as many as the kernel follows
constexpr mode_t kNewFileMode = 0666;
constexpr mode_t kPermissions = 0777;

// A link may lead to a file that does not exist yet.
std::optional<std::filesystem::path> followLinks(const std::filesystem::path& path,
                                                 std::string& error) {
  std::error_code failure;
  auto file = std::filesystem::absolute(path, failure);
  for (int i = 0; i < kMostLinks && !failure; ++i) {
    std::error_code isNoLink;
    if (!std::filesystem::is_symlink(file, isNoLink)) return file;
    // An absolute target takes the place of the whole path.
    file = file.parent_path() / std::filesystem::read_symlink(file, failure);
  }
  error = fileError(path, failure ? failure.message() : systemReason(ELOOP));
  return {};
}

// What the file becomes after a rename. Removed again if it does not come to that.
class TemporaryFile {
 public:
  explicit TemporaryFile(const std::filesystem::path& file)
      : name(hiddenSibling(file, ".tmp")),
        descriptor(::open(name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kNewFileMode)),
        isOurs(descriptor.isOpen()) {}
  ~TemporaryFile() {
    if (isOurs) ::unlink(name.c_str());
  }
  TemporaryFile(const TemporaryFile&) = delete;
  TemporaryFile& operator=(const TemporaryFile&) = delete;
  TemporaryFile(TemporaryFile&&) = delete;
  TemporaryFile& operator=(TemporaryFile&&) = delete;

  // Each step returns false with errno set.

  bool isOpen() const { return descriptor.isOpen(); }
  bool takePermissions(mode_t mode) const { return ::fchmod(descriptor.get(), mode) == 0; }
  bool write(std::string_view bytes) const;
  bool keep() { return ::fsync(descriptor.get()) == 0 && descriptor.close(); }
  bool moveTo(const std::filesystem::path& file) {
    isOurs = std::rename(name.c_str(), file.c_str()) != 0;
    return !isOurs;
  }

 private:
  std::filesystem::path name;
  UniqueFd descriptor;
  bool isOurs;
};

bool TemporaryFile::write(std::string_view bytes) const {
  while (!bytes.empty()) {
    const ssize_t count = ::write(descriptor.get(), bytes.data(), bytes.size());
    if (count < 0 && errno != EINTR) return false;
    if (count > 0) bytes.remove_prefix(static_cast<std::size_t>(count));
  }
  return true;
}

bool keepDirectory(const std::filesystem::path& directory) {
  const UniqueFd descriptor(::open(directory.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  if (!descriptor.isOpen()) return false;
  // EINVAL: a file system that has nothing to force.
  return ::fsync(descriptor.get()) == 0 || errno == EINVAL;
}

}  // namespace

std::optional<AtomicFile> AtomicFile::own(const std::filesystem::path& path, std::size_t mostBytes,
                                          std::string& error) {
  auto target = followLinks(path, error);
  if (!target) return {};
  FileLock held(*target, error);
  if (!held.isHeld()) return {};
  ::unlink(hiddenSibling(*target, ".tmp").c_str());  // what a killed owner left
  return AtomicFile(*std::move(target), std::move(held), mostBytes);
}

AtomicFile::AtomicFile(std::filesystem::path target, FileLock held, std::size_t mostBytes)
    : file(std::move(target)), lock(std::move(held)), limit(mostBytes) {}

bool AtomicFile::replace(std::string_view bytes, std::string& error) {
  if (bytes.size() > limit) {
    error = fileError(file, "would be longer than " + std::to_string(limit) + " bytes");
    return false;
  }
  struct stat old = {};
  const bool exists = ::stat(file.c_str(), &old) == 0;
  if (exists && !S_ISREG(old.st_mode)) {  // a device must not give way to a file
    error = fileError(file, "is not a regular file");
    return false;
  }
  TemporaryFile temporary(file);
  const bool isReplaced = temporary.isOpen() &&
                          (!exists || temporary.takePermissions(old.st_mode & kPermissions)) &&
                          temporary.write(bytes) && temporary.keep() && temporary.moveTo(file) &&
                          keepDirectory(file.parent_path());
  if (!isReplaced) error = fileError(file, "cannot be written: " + systemReason(errno));
  return isReplaced;
}

}  // namespace factory_test
