#include "remote/handover.h"

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <utility>

namespace brimol::pc {
namespace {

// More parts than this become the rectangle around them.
constexpr std::size_t kMaxParts = 64;

std::size_t bytesOf(int pixels) { return static_cast<std::size_t>(pixels) * sizeof(uint32_t); }

cairo_rectangle_int_t around(const Region& parts) {
  int right = 0;
  int bottom = 0;
  cairo_rectangle_int_t all = parts.front();
  for (const cairo_rectangle_int_t& part : parts) {
    all.x = std::min(all.x, part.x);
    all.y = std::min(all.y, part.y);
    right = std::max(right, part.x + part.width);
    bottom = std::max(bottom, part.y + part.height);
  }
  return {all.x, all.y, right - all.x, bottom - all.y};
}

}  // namespace

void Handover::give(cairo_surface_t* picture, const Region& changed) {
  const unsigned char* const pixels = cairo_image_surface_get_data(picture);
  const std::ptrdiff_t stride = cairo_image_surface_get_stride(picture);
  const std::lock_guard lock(mutex);
  for (const cairo_rectangle_int_t& part : changed) {
    for (int y = part.y; y < part.y + part.height; ++y) {
      std::memcpy(latest.row(part.x, y), pixels + y * stride + bytesOf(part.x),
                  bytesOf(part.width));
    }
    waiting.push_back(part);
  }
  if (waiting.size() > kMaxParts) waiting = {around(waiting)};
}

Region Handover::take(ServedPicture& shown) {
  const std::lock_guard lock(mutex);
  for (const cairo_rectangle_int_t& part : waiting) {
    for (int y = part.y; y < part.y + part.height; ++y) {
      std::memcpy(shown.row(part.x, y), latest.row(part.x, y), bytesOf(part.width));
    }
  }
  return std::exchange(waiting, {});
}

}  // namespace brimol::pc
