#include "painter/ink.h"

#include <algorithm>
#include <bit>
#include <cstring>
#include <utility>

#include "painter/blend.h"

namespace brimol::pc {

namespace {

constexpr std::size_t kGroupBytes = 16;
using GroupBytes [[gnu::vector_size(kGroupBytes)]] = uint8_t;
using GroupWords [[gnu::vector_size(2 * kGroupBytes)]] = uint16_t;
static_assert(sizeof(Tint::Pixels) == kGroupBytes);

struct Shares {
  std::array<uint16_t, kGroupBytes> parts;
  uint16_t alpha;
};

// Lays the colour over the pixels of one group, all bytes at once.
inline void mix(uint32_t* pixels, const CoveredGroup& group, const Shares& color) {
  constexpr uint16_t kFull = 255;
  constexpr int kByte = 8;
  GroupBytes bytes;
  GroupWords parts;
  std::memcpy(&bytes, pixels, sizeof bytes);
  std::memcpy(&parts, color.parts.data(), sizeof parts);
  const auto four = std::bit_cast<uint32_t>(group.coverage);
  const auto spread = std::bit_cast<GroupBytes>(Tint::Pixels{four, four, four, four});
  const GroupBytes each =
      __builtin_shufflevector(spread, spread, 0, 0, 0, 0, 1, 1, 1, 1, 2, 2, 2, 2, 3, 3, 3, 3);
  const GroupWords coverage = __builtin_convertvector(each, GroupWords);
  GroupWords added = parts * coverage + kHalf;
  added = (added + (added >> kByte)) >> kByte;
  GroupWords hidden = coverage * color.alpha + kHalf;
  hidden = (hidden + (hidden >> kByte)) >> kByte;
  GroupWords kept = __builtin_convertvector(bytes, GroupWords) * (kFull - hidden) + kHalf;
  kept = (kept + (kept >> kByte)) >> kByte;
  bytes = __builtin_convertvector(added + kept, GroupBytes);
  std::memcpy(pixels, &bytes, sizeof bytes);
}

// What cairo makes of a colour: each part times its alpha in 16 bits, of which it then uses the
// upper eight.
uint16_t partOf(uint32_t color, int shift) {
  constexpr double kFull = 255;
  constexpr double kWord = 65535;
  constexpr double kHalfStep = 0.5;
  constexpr int kAlphaShift = 24;
  const auto byteAt = [color](int by) { return static_cast<double>(color >> by & 0xFF) / kFull; };
  const double share = shift == kAlphaShift ? 1 : byteAt(shift);
  return static_cast<uint16_t>(
      static_cast<uint16_t>(share * byteAt(kAlphaShift) * kWord + kHalfStep) >> 8);
}

}  // namespace

Ink::Ink(uint32_t inkColor) : wanted(inkColor), alpha(partOf(inkColor, 24)) {
  constexpr std::size_t kPixelBytes = 4;
  constexpr int kByte = 8;
  static_assert(std::endian::native == std::endian::little);
  for (std::size_t i = 0; i < parts.size(); ++i) {
    parts[i] = partOf(inkColor, static_cast<int>(i % kPixelBytes) * kByte);
  }
}

void Ink::learn(uint32_t newGround) {
  ground = newGround;
  isLearnt = true;
  table.fill(ground);
  const Shares color = {parts, alpha};
  for (std::size_t i = 0; i < table.size(); i += CoveredGroup::kPixels) {
    const auto first = static_cast<uint8_t>(i);
    mix(&table[i],
        {0,
         {first, static_cast<uint8_t>(first + 1), static_cast<uint8_t>(first + 2),
          static_cast<uint8_t>(first + 3)}},
        color);
  }
}

// A table is learnt for a colour that comes twice in succession: over a picture it would be of no
// use.
void Ink::notice(uint32_t found) {
  if (found == candidate && (found != ground || !isLearnt)) learn(found);
  candidate = found;
}

void Ink::lay(uint32_t* row, int left, std::span<const CoveredGroup> groups) {
  if (groups.empty()) return;
  notice(row[left + groups.front().x]);
  layGroups(row, left, groups);
}

void Ink::layGroups(uint32_t* row, int left, std::span<const CoveredGroup> groups) const {
  const Shares color = {parts, alpha};
  const Tint::Pixels uniform = {ground, ground, ground, ground};
  for (const CoveredGroup& group : groups) {
    uint32_t* const pixels = row + (left + group.x);
    if (std::memcmp(pixels, uniform.data(), sizeof uniform) != 0) {
      mix(pixels, group, color);
      continue;
    }
    for (std::size_t i = 0; i < group.coverage.size(); ++i) pixels[i] = table[group.coverage[i]];
  }
}

void Ink::lay(uint32_t* left, std::ptrdiff_t stride, const CoveredRows& rows, Tint& tint) {
  if (rows.starts.front() == rows.starts.back()) return;
  const uint32_t found = left[rows.groups[rows.starts.front()].x];
  notice(found);
  const bool isTinted = prepare(tint, found, rows.groups);
  for (std::size_t row = 1; row < rows.starts.size(); ++row, left += stride) {
    const std::size_t first = rows.starts[row - 1];
    const auto groups = rows.groups.subspan(first, rows.starts[row] - first);
    isTinted ? layTinted(left, groups, tint.pixels.data() + first, found)
             : layGroups(left, 0, groups);
  }
}

// Pixels of another colour than the tint's ground are mixed.
void Ink::layTinted(uint32_t* left, std::span<const CoveredGroup> groups,
                    const Tint::Pixels* tinted, uint32_t below) const {
  const Shares color = {parts, alpha};
  const Tint::Pixels uniform = {below, below, below, below};
  for (const CoveredGroup& group : groups) {
    uint32_t* const pixels = left + group.x;
    if (std::memcmp(pixels, uniform.data(), sizeof uniform) == 0) {
      std::memcpy(pixels, tinted->data(), sizeof uniform);
    } else {
      mix(pixels, group, color);
    }
    ++tinted;
  }
}

// True where the tint is for this colour over the one that was found. It is made for colours that
// come twice in succession.
bool Ink::prepare(Tint& tint, uint32_t found, std::span<const CoveredGroup> groups) const {
  constexpr int kWord = 32;
  const uint64_t colors = uint64_t{wanted} << kWord | found;
  const bool isSecond = std::exchange(tint.latest, colors) == colors;
  if (tint.colors == colors) return true;
  if (!isSecond || !isLearnt || found != ground) return false;
  tint.pixels.resize(groups.size());
  std::ranges::transform(groups, tint.pixels.begin(), [this](const CoveredGroup& group) {
    const auto& [one, two, three, four] = group.coverage;
    return Tint::Pixels{table[one], table[two], table[three], table[four]};
  });
  tint.colors = colors;
  return true;
}

}  // namespace brimol::pc
