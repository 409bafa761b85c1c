/// The inner loops that mix colours: a colour laid over bytes of pixels.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

namespace brimol::pc {

/// A sum of products of two bytes, with kHalf at most 255 * 255 + kHalf, divided by 255 and
/// rounded. Every step fits 16 bits, so that the compiler works on many sums at a time.
inline constexpr uint16_t kHalf = 128;
constexpr uint8_t overFull(uint16_t sum) {
  return static_cast<uint8_t>(static_cast<uint16_t>(sum + (sum >> 8)) >> 8);
}

/// A colour with an alpha, made ready for laying it over many pixels.
struct BlendedColor {
  static constexpr std::size_t kBytes = 32;  // of pixels at a time
  std::array<uint16_t, kBytes> add;
  uint16_t keep;
};

/// `color` is 0xRRGGBB, its fourth byte counts as opaque; `alpha` is 0 to 255.
BlendedColor overlayOf(uint32_t color, int alpha);

/// Makes each of `count` bytes, which begin with a pixel, (byte * keep + add) / 255. The same bytes
/// on every processor.
void layOver(uint8_t* bytes, std::size_t count, const BlendedColor& overlay);

}  // namespace brimol::pc
