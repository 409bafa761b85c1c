#include "painter/blend.h"

#include <bit>

namespace brimol::pc {

namespace {

constexpr int kFull = 255;
constexpr uint32_t kOpaqueByte = 0xFF000000;
constexpr std::size_t kPixelBytes = sizeof(uint32_t);

static_assert(overFull(kFull * kFull + kHalf) == kFull);
static_assert(overFull(127 + kHalf) == 0 && overFull(128 + kHalf) == 1);

inline uint8_t byteOver(uint8_t old, uint16_t keep, uint16_t add) {
  return overFull(static_cast<uint16_t>(old * keep + add));
}

}  // namespace

BlendedColor overlayOf(uint32_t color, int alpha) {
  const auto bytes = std::bit_cast<std::array<uint8_t, kPixelBytes>>(color | kOpaqueByte);
  BlendedColor overlay = {};
  overlay.keep = static_cast<uint16_t>(kFull - alpha);
  for (std::size_t i = 0; i < BlendedColor::kBytes; ++i) {
    overlay.add[i] = static_cast<uint16_t>(bytes[i % kPixelBytes] * alpha + kHalf);
  }
  return overlay;
}

// In blocks whose constants stay in registers.
#ifdef BRIMOL_WIDE_LOOPS
[[gnu::target_clones("avx2", "default")]]
#endif
void layOver(uint8_t* bytes, std::size_t count, const BlendedColor& overlay) {
  const BlendedColor constants = overlay;
  std::size_t at = 0;
  for (; at + BlendedColor::kBytes <= count; at += BlendedColor::kBytes) {
    for (std::size_t i = 0; i < BlendedColor::kBytes; ++i) {
      bytes[at + i] = byteOver(bytes[at + i], constants.keep, constants.add[i]);
    }
  }
  for (std::size_t i = 0; at < count; ++at, ++i) {
    bytes[at] = byteOver(bytes[at], constants.keep, constants.add[i]);
  }
}

}  // namespace brimol::pc
