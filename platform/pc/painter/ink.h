/// A colour that is laid over pixels by their coverage, as glyphs are.
#pragma once

#include <array>
#include <cstdint>
#include <span>

namespace brimol::pc {

/// Four pixels of a row, and how much of each is covered.
struct CoveredGroup {
  static constexpr int kPixels = 4;
  uint16_t x;  // of the first pixel
  std::array<uint8_t, kPixels> coverage;
};

/// A text's colour. It mixes as cairo does it: the colour times the coverage, and the old pixel
/// times what that leaves, each product rounded. Over pixels of one colour, as most texts stand,
/// the results come from a table of all coverages. One thread uses it.
class Ink {
 public:
  /// 0xAARRGGBB
  explicit Ink(uint32_t inkColor);

  uint32_t color() const { return wanted; }

  /// Colours the groups' pixels in `row`; `left` is where their places are counted from.
  void lay(uint32_t* row, int left, std::span<const CoveredGroup> groups);

 private:
  static constexpr std::size_t kGroupBytes = 16;
  static constexpr std::size_t kCoverages = 256;

  void learn(uint32_t newGround);

  uint32_t wanted;
  std::array<uint16_t, kGroupBytes> parts;  // the colour times its alpha, for each byte of a group
  uint16_t alpha;
  uint32_t ground = 0;  // what `table` is for, once it is learnt
  bool isLearnt = false;
  uint32_t candidate = 0;                  // what the groups before began on
  std::array<uint32_t, kCoverages> table;  // by coverage
};

}  // namespace brimol::pc
