#include "painter/canvas.h"

#include <array>
#include <bit>
#include <cwchar>

#include "scene/item.h"

namespace brimol::pc {

namespace {

constexpr int kFull = 255;
constexpr int kHalf = 128;  // in a sum: rounds its division by 255

// A sum of products of two bytes, at most 255 * 255 + kHalf, divided by 255. Every step fits 16
// bits, so that the compiler works on eight sums at a time.
constexpr uint8_t overFull(uint16_t sum) {
  return static_cast<uint8_t>(static_cast<uint16_t>(sum + (sum >> 8)) >> 8);
}
constexpr uint16_t roundedSum(int products) { return static_cast<uint16_t>(products + kHalf); }
static_assert(overFull(roundedSum(kFull * kFull)) == kFull);
static_assert(overFull(roundedSum(127)) == 0 && overFull(roundedSum(128)) == 1);

constexpr std::size_t kPixelBytes = sizeof(uint32_t);
constexpr std::size_t kBlockBytes = 16;  // what the compiler turns into one step
using PixelBytes = std::array<uint8_t, kPixelBytes>;

// A colour laid over a pixel, byte by byte: (old * keep + add) / 255, the rounding being in `add`.
struct Overlay {
  std::array<uint16_t, kBlockBytes> add;
  uint16_t keep;
};

Overlay overlayOf(uint32_t color, int alpha) {
  const auto bytes = std::bit_cast<PixelBytes>(color | kOpaque << 24);
  Overlay overlay = {};
  overlay.keep = static_cast<uint16_t>(kFull - alpha);
  for (std::size_t i = 0; i < kBlockBytes; ++i) {
    overlay.add[i] = roundedSum(bytes[i % kPixelBytes] * alpha);
  }
  return overlay;
}

uint8_t laidOver(uint8_t old, uint16_t keep, uint16_t add) {
  return overFull(static_cast<uint16_t>(old * keep + add));
}

// Lays the colour over every byte of a row, in blocks whose constants stay in registers.
void layOver(uint8_t* bytes, std::size_t count, const Overlay& overlay) {
  const Overlay constants = overlay;
  std::size_t at = 0;
  for (; at + kBlockBytes <= count; at += kBlockBytes) {
    for (std::size_t i = 0; i < kBlockBytes; ++i) {
      bytes[at + i] = laidOver(bytes[at + i], constants.keep, constants.add[i]);
    }
  }
  for (std::size_t i = 0; at < count; ++at, ++i) {
    bytes[at] = laidOver(bytes[at], constants.keep, constants.add[i]);
  }
}

// Pixels as bytes and as wide characters: a row of one colour is what the C library writes fastest.
static_assert(sizeof(wchar_t) == kPixelBytes);
uint8_t* bytesOf(uint32_t* pixels) { return reinterpret_cast<uint8_t*>(pixels); }
void fillRow(uint32_t* pixels, int count, uint32_t color) {
  std::wmemset(reinterpret_cast<wchar_t*>(pixels), static_cast<wchar_t>(color),
               static_cast<std::size_t>(count));
}

}  // namespace

Canvas::Canvas(Size size)
    : picture(cairo_image_surface_create(CAIRO_FORMAT_RGB24, size.w, size.h)),
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
  const int end = area.y + area.height;
  if (alpha == kOpaque) {
    for (int y = area.y; y < end; ++y) fillRow(row(y) + area.x, area.width, color);
    return;
  }
  const Overlay overlay = overlayOf(color, static_cast<int>(alpha));
  const std::size_t bytes = static_cast<std::size_t>(area.width) * kPixelBytes;
  for (int y = area.y; y < end; ++y) layOver(bytesOf(row(y) + area.x), bytes, overlay);
}

void Canvas::cover(int x, int y, uint32_t color, int coverage) const {
  const int alpha = overFull(roundedSum(static_cast<int>(alphaOf(color)) * coverage));
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
