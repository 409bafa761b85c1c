#include "host/saved_picture.h"

#include <fcntl.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <system_error>

#include "host/png_file.h"

namespace brimol::pc {

namespace {

namespace fs = std::filesystem;

std::string stemOf(std::time_t now) {
  std::tm parts = {};
  localtime_r(&now, &parts);
  std::array<char, 64> text = {};
  return {text.data(), std::strftime(text.data(), text.size(), "brimol-%Y%m%d-%H%M%S", &parts)};
}

// An empty file of a name that was free; an empty path, with errno, where none can be made.
fs::path reserve(const fs::path& folder, const std::string& stem) {
  constexpr mode_t kMode = 0666;
  for (int number = 1;; ++number) {
    fs::path path = folder / (number == 1 ? stem : stem + "-" + std::to_string(number));
    path += ".png";
    const int file = ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kMode);
    if (file >= 0) {
      ::close(file);
      return path;
    }
    if (errno != EEXIST) return {};
  }
}

}  // namespace

std::string savePicture(cairo_surface_t* picture, const fs::path& folder, std::time_t now) {
  const fs::path path = reserve(folder, stemOf(now));
  if (path.empty()) {
    return "cannot save a picture in " + folder.native() + ": " +
           std::generic_category().message(errno);
  }
  std::string error = writePng(picture, path);
  if (error.empty()) return "the picture is saved as " + path.native();
  std::error_code ignored;
  fs::remove(path, ignored);
  return error;
}

}  // namespace brimol::pc
