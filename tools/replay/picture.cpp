#include "picture.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <fstream>
#include <iterator>
#include <span>

namespace brimol::replay {

namespace {

struct ContextDeleter {
  void operator()(cairo_t* context) const { cairo_destroy(context); }
};
using Context = std::unique_ptr<cairo_t, ContextDeleter>;

constexpr uint32_t kColourMask = 0x00FFFFFF;

int widthOf(const Surface& surface) { return cairo_image_surface_get_width(surface.get()); }
int heightOf(const Surface& surface) { return cairo_image_surface_get_height(surface.get()); }

std::span<uint32_t> rowOf(const Surface& surface, int y) {
  const auto stride = static_cast<std::ptrdiff_t>(cairo_image_surface_get_stride(surface.get()));
  unsigned char* const bytes = cairo_image_surface_get_data(surface.get()) + y * stride;
  // Cairo aligns the rows of these formats for whole pixels.
  return {reinterpret_cast<uint32_t*>(bytes), static_cast<std::size_t>(widthOf(surface))};
}

// The picture at so much of its size, on a ground of its own.
Surface scaled(const Surface& picture, int width, int height) {
  Surface result(cairo_image_surface_create(CAIRO_FORMAT_RGB24, width, height));
  const Context context(cairo_create(result.get()));
  cairo_scale(context.get(), static_cast<double>(width) / widthOf(picture),
              static_cast<double>(height) / heightOf(picture));
  cairo_set_source_surface(context.get(), picture.get(), 0, 0);
  cairo_pattern_set_filter(cairo_get_source(context.get()), CAIRO_FILTER_GOOD);
  cairo_pattern_set_extend(cairo_get_source(context.get()), CAIRO_EXTEND_PAD);
  cairo_paint(context.get());
  cairo_surface_flush(result.get());
  return result;
}

// Whatever the file's own format, so that pixels can be compared.
Surface withoutAlpha(Surface picture) {
  const bool isPlain = cairo_image_surface_get_format(picture.get()) == CAIRO_FORMAT_RGB24;
  return isPlain ? std::move(picture) : scaled(picture, widthOf(picture), heightOf(picture));
}

// What stays the same is grey and faint behind what differs.
uint32_t faint(uint32_t pixel) {
  constexpr uint32_t kByte = 0xFF;
  constexpr uint32_t kLightest = 208;
  const uint32_t grey = ((pixel >> 16 & kByte) + (pixel >> 8 & kByte) + (pixel & kByte)) / 3;
  const uint32_t shade = kLightest + grey * (kByte - kLightest) / kByte;
  return shade << 16 | shade << 8 | shade;
}

struct PngSource {
  std::string_view rest;
};

cairo_status_t readSome(void* closure, unsigned char* data, unsigned int length) {
  auto& source = *static_cast<PngSource*>(closure);
  if (source.rest.size() < length) return CAIRO_STATUS_READ_ERROR;
  std::memcpy(data, source.rest.data(), length);
  source.rest.remove_prefix(length);
  return CAIRO_STATUS_SUCCESS;
}

cairo_status_t writeSome(void* closure, const unsigned char* data, unsigned int length) {
  static_cast<std::string*>(closure)->append(data, data + length);
  return CAIRO_STATUS_SUCCESS;
}

// 0 for a place outside the picture.
uint32_t pixelAt(std::span<const uint32_t> row, int x) {
  const auto place = static_cast<std::size_t>(x);
  return place < row.size() ? row[place] & kColourMask : ~kColourMask;
}

}  // namespace

std::string bytesOf(const std::filesystem::path& file) {
  std::error_code failure;
  if (!std::filesystem::is_regular_file(file, failure)) return {};
  std::ifstream stream(file, std::ios::binary);
  return {std::istreambuf_iterator<char>(stream), {}};
}

Surface decodePng(std::string_view bytes) {
  PngSource source{bytes};
  Surface picture(cairo_image_surface_create_from_png_stream(readSome, &source));
  if (cairo_surface_status(picture.get()) != CAIRO_STATUS_SUCCESS) return nullptr;
  return withoutAlpha(std::move(picture));
}

std::string encodePng(const Surface& surface) {
  std::string bytes;
  cairo_surface_write_to_png_stream(surface.get(), writeSome, &bytes);
  return bytes;
}

Surface fitted(const Surface& picture, int width, int height) {
  const double scale = std::min({1.0, static_cast<double>(width) / widthOf(picture),
                                 static_cast<double>(height) / heightOf(picture)});
  return scaled(picture, std::max(1, static_cast<int>(widthOf(picture) * scale)),
                std::max(1, static_cast<int>(heightOf(picture) * scale)));
}

Difference differenceOf(const Surface& one, const Surface& other) {
  const int width = std::max(widthOf(one), widthOf(other));
  const int height = std::max(heightOf(one), heightOf(other));
  Difference difference;
  difference.picture.reset(cairo_image_surface_create(CAIRO_FORMAT_RGB24, width, height));
  constexpr uint32_t kDiffers = 0xC2185B;
  cairo_surface_flush(difference.picture.get());
  for (int y = 0; y < height; ++y) {
    const auto mine = y < heightOf(one) ? rowOf(one, y) : std::span<uint32_t>();
    const auto theirs = y < heightOf(other) ? rowOf(other, y) : std::span<uint32_t>();
    const auto shown = rowOf(difference.picture, y);
    for (int x = 0; x < width; ++x) {
      const uint32_t pixel = pixelAt(mine, x);
      const bool differs = pixel != pixelAt(theirs, x);
      difference.pixels += differs ? 1 : 0;
      shown[static_cast<std::size_t>(x)] = differs ? kDiffers : faint(pixel);
    }
  }
  cairo_surface_mark_dirty(difference.picture.get());
  if (difference.pixels == 0) difference.picture.reset();
  return difference;
}

std::string base64(std::string_view bytes) {
  constexpr std::string_view kDigits =
      "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  constexpr std::size_t kGroup = 3;
  constexpr uint32_t kDigitMask = 0x3F;
  std::string text;
  text.reserve((bytes.size() + 2) / kGroup * 4);
  for (std::size_t at = 0; at < bytes.size(); at += kGroup) {
    uint32_t group = 0;
    for (std::size_t i = 0; i < kGroup; ++i) {
      const char byte = at + i < bytes.size() ? bytes[at + i] : '\0';
      group = group << 8 | static_cast<unsigned char>(byte);
    }
    for (const int shift : {18, 12, 6, 0}) text += kDigits[group >> shift & kDigitMask];
  }
  const std::size_t missing = (kGroup - bytes.size() % kGroup) % kGroup;
  text.replace(text.size() - missing, missing, missing, '=');
  return text;
}

uint64_t hashOf(std::string_view bytes) {
  uint64_t hash = 0xCBF29CE484222325;
  for (const char byte : bytes) {
    hash ^= static_cast<unsigned char>(byte);
    hash *= 0x100000001B3;
  }
  return hash;
}

}  // namespace brimol::replay
