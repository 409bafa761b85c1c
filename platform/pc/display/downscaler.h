/// Makes pictures smaller.
#pragma once

#include <cairo.h>

#include <cstdint>
#include <vector>

#include "scene/geometry.h"

namespace brimol::pc {

/// What the pixels along one side of a smaller picture take of those of the larger one.
struct Shares {
  /// What one pixel takes: the pixels from `first` on, by the weights from `weight` on.
  struct Share {
    int first;
    int count;
    std::size_t weight;
  };

  /// `targetSide` is 1 to `sourceSide`. The weights of one pixel add up to exactly `whole`.
  Shares(int sourceSide, int targetSide, std::uint32_t whole);

  std::vector<Share> shares;  // by pixel of the smaller picture
  std::vector<std::uint32_t> weights;
};

/// Scales pictures down. Each pixel is the average of the area that it covers, and depends on
/// nothing else: a part is the same whether it is scaled alone or with the rest. In full size the
/// pixels stay as they are.
class Downscaler {
 public:
  /// Each side of `target` is 1 to that of `source`.
  Downscaler(Size source, Size target);

  /// Scales what belongs to `part` of the smaller picture, which lies within it, and puts it at the
  /// same place of `to`, counted from `origin`, the address of the picture's first pixel there; a
  /// line of `to` is `stride` bytes. `from` is CAIRO_FORMAT_RGB24 of the source's size, `to` is
  /// too.
  void scale(cairo_surface_t* from, const cairo_rectangle_int_t& part, unsigned char* origin,
             int stride);

 private:
  void addUpRows(cairo_surface_t* from, int row, int firstColumn, int endColumn);
  void writePixel(int column, unsigned char* pixel) const;

  const bool isCopy;
  Shares across;
  Shares down;
  std::vector<std::uint16_t> sums;  // of one line's area, for each byte of a source line
};

}  // namespace brimol::pc
