#include "host/png_file.h"

#include <unistd.h>

#include <cerrno>
#include <filesystem>
#include <system_error>

namespace brimol::pc {
namespace {

namespace fs = std::filesystem;

std::string failure(const std::string& path, const std::string& reason) {
  return "cannot write " + path + ": " + reason;
}

// Of a failed cairo call that was entered with errno 0.
std::string reasonOf(cairo_status_t status) {
  return errno != 0 ? std::generic_category().message(errno) : cairo_status_to_string(status);
}

}  // namespace

std::string writePng(cairo_surface_t* picture, const std::string& path) {
  std::error_code ignored;
  // A device or a directory must not be replaced by the picture.
  if (fs::exists(path, ignored) && !fs::is_regular_file(path, ignored)) {
    return failure(path, "it exists and is not a file");
  }
  const std::string unfinished = path + "." + std::to_string(::getpid()) + ".part";
  errno = 0;
  if (const auto status = cairo_surface_write_to_png(picture, unfinished.c_str());
      status != CAIRO_STATUS_SUCCESS) {
    const std::string reason = reasonOf(status);
    fs::remove(unfinished, ignored);
    return failure(path, reason);
  }
  std::error_code error;
  fs::rename(unfinished, path, error);
  if (!error) return {};
  fs::remove(unfinished, ignored);
  return failure(path, error.message());
}

}  // namespace brimol::pc
