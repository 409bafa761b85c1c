#include "painter/png_reader.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <limits>
#include <optional>
#include <span>
#include <vector>

namespace brimol::pc {

namespace {

using Bytes = std::vector<unsigned char>;

constexpr off_t kMostFileBytes = off_t{64} << 20;

// A PNG file starts with these bytes and the length of its header, whose name and sizes follow.
constexpr auto kSignature = std::to_array<unsigned char>(
    {0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n', 0, 0, 0, 13, 'I', 'H', 'D', 'R'});
constexpr std::size_t kWidthAt = kSignature.size();
constexpr std::size_t kHeightAt = kWidthAt + 4;
constexpr std::size_t kHeaderBytes = kHeightAt + 4;

class File {
 public:
  // Opening does not wait, so that a pipe without a writer holds nobody up.
  explicit File(const std::string& name)
      : descriptor(open(name.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK)) {}
  ~File() {
    if (descriptor >= 0) close(descriptor);
  }
  File(const File&) = delete;
  File& operator=(const File&) = delete;

  // The file's bytes; none when it is not a regular file of a bounded size.
  Bytes read() const {
    struct stat status = {};
    if (descriptor < 0 || fstat(descriptor, &status) != 0) return {};
    if (!S_ISREG(status.st_mode) || status.st_size > kMostFileBytes) return {};
    Bytes bytes(static_cast<std::size_t>(status.st_size));
    std::size_t filled = 0;
    while (filled < bytes.size()) {
      const ssize_t count = ::read(descriptor, &bytes[filled], bytes.size() - filled);
      if (count <= 0) return {};
      filled += static_cast<std::size_t>(count);
    }
    return bytes;
  }

 private:
  int descriptor;
};

std::optional<int> sideAt(const Bytes& file, std::size_t at) {
  uint32_t side = 0;
  for (std::size_t i = at; i < at + sizeof side; ++i) side = side << 8 | file[i];
  if (side == 0 || side > uint32_t{std::numeric_limits<int>::max()}) return std::nullopt;
  return static_cast<int>(side);
}

std::optional<Size> sizeOf(const Bytes& file) {
  if (file.size() < kHeaderBytes) return std::nullopt;
  if (!std::equal(kSignature.begin(), kSignature.end(), file.begin())) return std::nullopt;
  const std::optional<int> width = sideAt(file, kWidthAt);
  const std::optional<int> height = sideAt(file, kHeightAt);
  if (!width || !height) return std::nullopt;
  return Size{*width, *height};
}

cairo_status_t takeBytes(void* closure, unsigned char* data, unsigned int length) {
  auto& rest = *static_cast<std::span<const unsigned char>*>(closure);
  if (length > rest.size()) return CAIRO_STATUS_READ_ERROR;
  std::copy_n(rest.begin(), length, data);
  rest = rest.subspan(length);
  return CAIRO_STATUS_SUCCESS;
}

}  // namespace

CairoSurface readPng(const std::string& name, bool (*isWanted)(Size size)) {
  const Bytes file = File(name).read();
  const std::optional<Size> size = sizeOf(file);
  if (!size || !isWanted(*size)) return nullptr;
  std::span<const unsigned char> rest(file);
  CairoSurface picture(cairo_image_surface_create_from_png_stream(takeBytes, &rest));
  if (cairo_surface_status(picture.get()) != CAIRO_STATUS_SUCCESS) return nullptr;
  return picture;
}

}  // namespace brimol::pc
