#include "host/whole_file.h"

#include <unistd.h>

#include <filesystem>
#include <system_error>

#include "scene/quoted_text.h"

namespace brimol::pc {
namespace {

namespace fs = std::filesystem;

std::string failure(const std::string& path, const std::string& reason) {
  return printable("cannot write " + path + ": " + reason);
}

}  // namespace

std::string writeWhole(const std::string& path,
                       const std::function<std::string(const std::string& unfinished)>& write) {
  std::error_code ignored;
  // A device or a directory must not be replaced.
  if (fs::exists(path, ignored) && !fs::is_regular_file(path, ignored)) {
    return failure(path, "it exists and is not a file");
  }
  const std::string unfinished = path + "." + std::to_string(::getpid()) + ".part";
  fs::remove(unfinished, ignored);  // it may be a link
  std::string reason = write(unfinished);
  std::error_code error;
  if (reason.empty()) fs::rename(unfinished, path, error);
  if (error) reason = error.message();
  if (reason.empty()) return {};
  fs::remove(unfinished, ignored);
  return failure(path, reason);
}

}  // namespace brimol::pc
