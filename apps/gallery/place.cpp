#include "place.h"

#include <MW/window.h>

#include <filesystem>
#include <mutex>
#include <system_error>

namespace gallery {

namespace {

constexpr int kHundred = 100;
constexpr int kLettersInHeight = 36;

constinit std::mutex lineLock;

std::string spoken;  // guarded by lineLock

}  // namespace

SKIA_Rect place(int left, int top, int width, int height, uint32_t color) {
  const auto x = [](int percent) { return MW::Window::width * percent / kHundred; };
  const auto y = [](int percent) { return MW::Window::height * percent / kHundred; };
  return {x(left), y(top), x(width), y(height), color};
}

SKIA_Text words(const std::string& text, uint32_t color, int32_t align) {
  SKIA_Text record = {{}, 0, color, align, MW::Window::height / kLettersInHeight};
  record.string_len = static_cast<int32_t>(text.copy(record.text, SKIA_TEXT_BYTES - 1));
  return record;
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
