/// A colour that is laid over pixels by their coverage, as glyphs are.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

namespace brimol::pc {

/// Four pixels of a row, and how much of each is covered.
struct CoveredGroup {
  static constexpr int kPixels = 4;
  uint16_t x;  // of the first pixel
  std::array<uint8_t, kPixels> coverage;
};

/// Such groups row by row.
struct CoveredRows {
  std::span<const CoveredGroup> groups;
  std::span<const uint32_t> starts;  // of each row in `groups`, and where the last row ends
};

/// What groups become in one colour over another one, kept by whoever draws them again and again.
struct Tint {
  using Pixels = std::array<uint32_t, CoveredGroup::kPixels>;
  uint64_t colors = 0;         // of `pixels`, once there are any
  uint64_t latest = 0;         // of the drawing before
  std::vector<Pixels> pixels;  // by group
};

/// A text's colour. It mixes as cairo does it: the colour times the coverage, and the old pixel
/// times what that leaves, each product rounded. Over pixels of one colour, as most texts stand,
/// the results come from a table of all coverages, and for groups that come again from their tint.
/// One thread uses it.
class Ink {
 public:
  /// 0xAARRGGBB
  explicit Ink(uint32_t inkColor);

  uint32_t color() const { return wanted; }

  /// Colours the groups' pixels in `row`; `left` is where their places are counted from.
  void lay(uint32_t* row, int left, std::span<const CoveredGroup> groups);

  /// Colours rows that follow each other by `stride` pixels. `left` is the pixel of the first row
  /// from which places are counted. `tint` belongs to the groups.
  void lay(uint32_t* left, std::ptrdiff_t stride, const CoveredRows& rows, Tint& tint);

 private:
  static constexpr std::size_t kGroupBytes = 16;
  static constexpr std::size_t kCoverages = 256;

  void notice(uint32_t found);
  void learn(uint32_t newGround);
  void layGroups(uint32_t* row, int left, std::span<const CoveredGroup> groups) const;
  void layTinted(uint32_t* left, std::span<const CoveredGroup> groups, const Tint::Pixels* tinted,
                 uint32_t below) const;
  bool prepare(Tint& tint, uint32_t found, std::span<const CoveredGroup> groups) const;

  uint32_t wanted;
  std::array<uint16_t, kGroupBytes> parts;  // the colour times its alpha, for each byte of a group
  uint16_t alpha;
  uint32_t ground = 0;  // what `table` is for, once it is learnt
  bool isLearnt = false;
  uint32_t candidate = 0;                  // what the drawing before began on
  std::array<uint32_t, kCoverages> table;  // by coverage
};

}  // namespace brimol::pc
