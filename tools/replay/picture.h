/// Pictures of frames: PNG files, their thumbnails, and what differs between two.
#pragma once

#include <cairo.h>

#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>
#include <string_view>

namespace brimol::replay {

struct SurfaceDeleter {
  void operator()(cairo_surface_t* surface) const { cairo_surface_destroy(surface); }
};
/// Pixels of 0xXXRRGGBB. Null: there is no picture.
using Surface = std::unique_ptr<cairo_surface_t, SurfaceDeleter>;

/// What the file holds. Empty: it cannot be read.
std::string bytesOf(const std::filesystem::path& file);

/// Null for what is no PNG file.
Surface decodePng(std::string_view bytes);
std::string encodePng(const Surface& surface);

/// The picture made smaller, so that it fits into the size, with its proportions kept; the picture
/// itself if it fits.
Surface fitted(const Surface& picture, int width, int height);

struct Difference {
  int64_t pixels = 0;  // that differ; those outside the smaller of two sizes do
  Surface picture;     // the first one, faint, and what differs in full colour; null without any
};
Difference differenceOf(const Surface& one, const Surface& other);

std::string base64(std::string_view bytes);

/// 64-bit FNV-1a.
uint64_t hashOf(std::string_view bytes);

}  // namespace brimol::replay
