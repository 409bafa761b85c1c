#include "scene/new_picture.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cstddef>
#include <memory>

namespace brimol::pc {

namespace {

// A phone's picture has thousands of pages, each of which costs a page fault when it is first
// written. In large pages, where the system has some left, they are a few.
void wantLargePages(cairo_surface_t* picture) {
  constexpr std::size_t kLargePage = std::size_t{2} << 20;
  const auto page = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
  const auto stride = static_cast<std::size_t>(cairo_image_surface_get_stride(picture));
  std::size_t room = stride * static_cast<std::size_t>(cairo_image_surface_get_height(picture));
  if (room < kLargePage) return;
  void* start = cairo_image_surface_get_data(picture);
  if (std::align(page, kLargePage, start, room) == nullptr) return;
  madvise(start, room / page * page, MADV_HUGEPAGE);
}

}  // namespace

CairoSurface newPicture(Size size) {
  CairoSurface picture(cairo_image_surface_create(CAIRO_FORMAT_RGB24, size.w, size.h));
  wantLargePages(picture.get());
  return picture;
}

}  // namespace brimol::pc
