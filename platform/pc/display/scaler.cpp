#include "display/scaler.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstring>

namespace brimol::pc {
namespace {

constexpr int kPixelBytes = 4;
// The sums of a column have 16 bits: a colour times the whole of the rows. Times the whole of the
// columns they have 32.
constexpr std::uint32_t kWholeDown = 1U << 8;
constexpr std::uint32_t kWholeAcross = 1U << 16;
constexpr int kWholeBits = 24;
static_assert(255U * kWholeDown <= 0xFFFF);
static_assert(255ULL * kWholeDown * kWholeAcross + (1ULL << (kWholeBits - 1)) <= 0xFFFFFFFF);

std::size_t bytesOf(int pixels) { return static_cast<std::size_t>(pixels) * kPixelBytes; }

const unsigned char* lineOf(cairo_surface_t* picture, int row) {
  return cairo_image_surface_get_data(picture) +
         std::ptrdiff_t{row} * cairo_image_surface_get_stride(picture);
}

void copy(cairo_surface_t* from, const cairo_rectangle_int_t& part, unsigned char* origin,
          int stride) {
  for (int row = part.y; row < part.y + part.height; ++row) {
    std::memcpy(origin + std::ptrdiff_t{row} * stride + bytesOf(part.x),
                lineOf(from, row) + bytesOf(part.x), bytesOf(part.width));
  }
}

}  // namespace

// One source pixel is `targetSide` units long here, and one target pixel `sourceSide` units.
Shares::Shares(int sourceSide, int targetSide, std::uint32_t whole) {
  const std::int64_t unitsOfTarget = sourceSide;
  const std::int64_t unitsOfSource = targetSide;
  for (int pixel = 0; pixel < targetSide; ++pixel) {
    const std::int64_t start = pixel * unitsOfTarget;
    const std::int64_t end = start + unitsOfTarget;
    const auto first = static_cast<int>(start / unitsOfSource);
    const auto last = static_cast<int>((end - 1) / unitsOfSource);
    shares.push_back({first, last - first + 1, weights.size()});
    // Differences of rounded sums, so that the rounding errors do not add up.
    std::int64_t given = 0;
    for (int source = first; source <= last; ++source) {
      const std::int64_t covered = std::min((source + 1) * unitsOfSource, end) - start;
      const std::int64_t sum = covered * whole / unitsOfTarget;
      weights.push_back(static_cast<std::uint32_t>(sum - given));
      given = sum;
    }
  }
}

Scaler::Scaler(Size source, Size target)
    : isCopy(source == target),
      across(source.w, target.w, kWholeAcross),
      down(source.h, target.h, kWholeDown),
      sums(bytesOf(source.w)) {}

void Scaler::scale(cairo_surface_t* from, const cairo_rectangle_int_t& part, unsigned char* origin,
                   int stride) {
  if (part.width <= 0) return;
  if (isCopy) return copy(from, part, origin, stride);
  const auto share = [this](int column) { return across.shares[static_cast<std::size_t>(column)]; };
  const Shares::Share last = share(part.x + part.width - 1);
  for (int row = part.y; row < part.y + part.height; ++row) {
    addUpRows(from, row, share(part.x).first, last.first + last.count);
    unsigned char* const line = origin + std::ptrdiff_t{row} * stride;
    for (int column = part.x; column < part.x + part.width; ++column) {
      writePixel(column, line + bytesOf(column));
    }
  }
}

void Scaler::addUpRows(cairo_surface_t* from, int row, int firstColumn, int endColumn) {
  const Shares::Share share = down.shares[static_cast<std::size_t>(row)];
  const std::size_t start = bytesOf(firstColumn);
  const std::size_t count = bytesOf(endColumn - firstColumn);
  std::uint16_t* const sum = sums.data() + start;
  std::fill_n(sum, count, std::uint16_t{0});
  for (int i = 0; i < share.count; ++i) {
    const unsigned char* const source = lineOf(from, share.first + i) + start;
    const auto weight =
        static_cast<std::uint16_t>(down.weights[share.weight + static_cast<std::size_t>(i)]);
    for (std::size_t byte = 0; byte < count; ++byte) {
      sum[byte] = static_cast<std::uint16_t>(sum[byte] + source[byte] * weight);
    }
  }
}

void Scaler::writePixel(int column, unsigned char* pixel) const {
  const Shares::Share share = across.shares[static_cast<std::size_t>(column)];
  std::array<std::uint32_t, kPixelBytes> colour;
  colour.fill(1U << (kWholeBits - 1));
  const std::uint16_t* sum = sums.data() + bytesOf(share.first);
  for (int i = 0; i < share.count; ++i, sum += kPixelBytes) {
    const std::uint32_t weight = across.weights[share.weight + static_cast<std::size_t>(i)];
    for (std::size_t byte = 0; byte < kPixelBytes; ++byte) colour[byte] += sum[byte] * weight;
  }
  for (std::size_t byte = 0; byte < kPixelBytes; ++byte) {
    pixel[byte] = static_cast<unsigned char>(colour[byte] >> kWholeBits);
  }
}

}  // namespace brimol::pc
