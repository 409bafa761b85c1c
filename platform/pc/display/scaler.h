/// Makes pictures smaller or larger.
#pragma once

#include <cairo.h>

#include <cstdint>
#include <vector>

#include "scene/geometry.h"

namespace brimol::pc {

/// Which pixels of the source make up each pixel along one side of the target.
struct Shares {
  /// One pixel: the source's `count` pixels from `first` on, by the weights from `weight` on.
  struct Share {
    int first;
    int count;
    std::size_t weight;
  };

  /// Both sides are at least 1. The weights of one pixel add up to exactly `whole`.
  Shares(int sourceSide, int targetSide, std::uint32_t whole);

  std::vector<Share> shares;  // by pixel of the target
  std::vector<std::uint32_t> weights;
};

/// Scales pictures. Each pixel is the average of the area that it covers, so a part comes out the
/// same whether it is scaled alone or with the rest, and edges stay sharp in a larger picture. In
/// full size the pixels stay as they are.
class Scaler {
 public:
  /// Each side is at least 1.
  Scaler(Size source, Size target);

  /// Writes `part` of the target, which lies within it. `from` has the source's size. `origin` is
  /// where the target's first pixel stands, and its lines are `stride` bytes apart. Both are
  /// CAIRO_FORMAT_RGB24.
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
