#include "place.h"

#include <MW/window.h>

#include <algorithm>
#include <filesystem>
#include <mutex>
#include <system_error>

namespace gallery {

namespace {

constinit std::mutex lineLock;

std::string spoken;  // guarded by lineLock

}  // namespace

int atLeastMm(int pixels, float mm) {
  return std::max(pixels, MW::Window::getMura(nullptr, nullptr, mm));
}

std::string pictureFile(const std::string& name) {
  std::error_code failed;
  if (std::filesystem::exists(name, failed)) return name;
  const auto folder = std::filesystem::read_symlink("/proc/self/exe", failed).parent_path();
  const auto built = folder / name;
  if (std::filesystem::exists(built, failed)) return built.string();
  return (folder.parent_path() / "share" / "brimol_gallery" / name).string();
}

void say(const std::string& line) {
  {
    const std::lock_guard guard(lineLock);
    spoken = line;
  }
  MW::isDisplayUpdate(1);
}

void say(const std::string& line, int64_t number) { say(line + ' ' + std::to_string(number)); }

std::string said() {
  const std::lock_guard guard(lineLock);
  return spoken;
}

}  // namespace gallery
