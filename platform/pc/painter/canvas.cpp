#include "painter/canvas.h"

#include <cwchar>

#include "painter/blend.h"
#include "scene/item.h"
#include "scene/new_picture.h"

namespace brimol::pc {

namespace {

constexpr std::size_t kPixelBytes = sizeof(uint32_t);

uint8_t* bytesOf(uint32_t* pixels) { return reinterpret_cast<uint8_t*>(pixels); }

// Short runs as wide characters, which the C library writes fastest. Long ones by the processor's
// own instruction where there is one: it overwrites memory without reading it first.
static_assert(sizeof(wchar_t) == kPixelBytes);
void fillRun(uint32_t* pixels, std::size_t count, uint32_t color) {
#ifdef __x86_64__
  constexpr std::size_t kLongRun = 1024;
  if (count >= kLongRun) {
    asm volatile("rep stosl" : "+D"(pixels), "+c"(count) : "a"(color) : "memory");
    return;
  }
#endif
  std::wmemset(reinterpret_cast<wchar_t*>(pixels), static_cast<wchar_t>(color), count);
}

}  // namespace

Canvas::Canvas(Size size)
    : picture(newPicture(size)),
      drawing(cairo_create(picture.get())),
      pixels(reinterpret_cast<uint32_t*>(cairo_image_surface_get_data(picture.get()))),
      stride(cairo_image_surface_get_stride(picture.get()) /
             static_cast<std::ptrdiff_t>(kPixelBytes)),
      extent{cairo_image_surface_get_width(picture.get()),
             cairo_image_surface_get_height(picture.get())} {
  fill(wholeOf(extent), kOpaque << 24);
}

cairo_t* Canvas::context() const {
  cairo_surface_mark_dirty(picture.get());
  return drawing.get();
}

void Canvas::fill(const Pixels& area, uint32_t color) const {
  const uint32_t alpha = alphaOf(color);
  if (alpha == 0) return;
  // Whole rows lie in memory without a gap: they are one run.
  const bool isOneRun = area.width == extent.w && stride == extent.w;
  const int runs = isOneRun ? 1 : area.height;
  const std::size_t count =
      static_cast<std::size_t>(area.width) * static_cast<std::size_t>(isOneRun ? area.height : 1);
  const auto eachRun = [&](auto work) {
    for (int y = area.y; y < area.y + runs; ++y) work(row(y) + area.x);
  };
  if (alpha == kOpaque) return eachRun([&](uint32_t* run) { fillRun(run, count, color); });
  const BlendedColor overlay = overlayOf(color, static_cast<int>(alpha));
  eachRun([&](uint32_t* run) { layOver(bytesOf(run), count * kPixelBytes, overlay); });
}

uint32_t laidOver(uint32_t below, uint32_t color) {
  if (alphaOf(color) == kOpaque) return color;
  layOver(bytesOf(&below), kPixelBytes, overlayOf(color, static_cast<int>(alphaOf(color))));
  return below;
}

void Canvas::cover(int x, int y, uint32_t color, int coverage) const {
  const int alpha =
      overFull(static_cast<uint16_t>(static_cast<int>(alphaOf(color)) * coverage + kHalf));
  if (alpha == 0) return;
  layOver(bytesOf(row(y) + x), kPixelBytes, overlayOf(color, alpha));
}

void Canvas::cover(const Pixels& area, const Pixels& corner, cairo_surface_t* mask,
                   uint32_t color) const {
  const uint8_t* const coverage = cairo_image_surface_get_data(mask);
  const std::ptrdiff_t maskStride = cairo_image_surface_get_stride(mask);
  for (int y = area.y; y < area.y + area.height; ++y) {
    const uint8_t* const line = coverage + (y - corner.y) * maskStride;
    for (int x = area.x; x < area.x + area.width; ++x) {
      const int share = line[x - corner.x];
      if (share != 0) cover(x, y, color, share);
    }
  }
}

}  // namespace brimol::pc
