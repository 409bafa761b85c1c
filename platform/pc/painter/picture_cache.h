/// Pictures from PNG files in the sizes in which they are shown.
#pragma once

#include <string>
#include <string_view>
#include <tuple>

#include "painter/lru_cache.h"
#include "scene/cairo_handles.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// Reads picture files and keeps the recent ones, scaled. One thread uses it.
class PictureCache {
 public:
  PictureCache() : pictures(kMostBytes) {}

  /// The picture of the file `name`, CAIRO_FORMAT_ARGB32 in size `size`, owned by the cache and
  /// valid until the next call. Null where the file is missing or no PNG file, or where it or
  /// `size` has more than kMostSide pixels on a side or kMostPixels in all. The next call tries a
  /// file that failed once more.
  cairo_surface_t* scaled(std::string_view name, Size size);

  /// Bytes of the pictures kept, bounded by kMostBytes.
  std::size_t bytes() const { return pictures.cost(); }

  static constexpr int kMostSide = 8192;
  static constexpr int64_t kMostPixels = int64_t{16} << 20;
  static constexpr std::size_t kMostBytes = std::size_t{64} << 20;

 private:
  struct Key {
    std::string name;
    int w;
    int h;
    friend bool operator<(const Key& one, const Key& other) {
      return std::tie(one.name, one.w, one.h) < std::tie(other.name, other.w, other.h);
    }
  };

  LruCache<Key, CairoSurface> pictures;
};

}  // namespace brimol::pc
