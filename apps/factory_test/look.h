/// The colours of all pages.
#pragma once

#include <array>
#include <cstdint>

namespace factory_test {

/// A text's colour on the colour behind it.
struct Ink {
  uint32_t ground;
  uint32_t text;
};

inline constexpr uint32_t kLight = 0xFFF4F7FB;
inline constexpr uint32_t kDark = 0xFF10151D;

inline constexpr Ink kPageInk = {0xFF161C26, kLight};
inline constexpr Ink kHeadInk = {0xFF23507A, kLight};
inline constexpr Ink kPanelInk = {0xFF2B3545, kLight};
inline constexpr Ink kButtonInk = {0xFFC9D3E1, kDark};
inline constexpr Ink kRowInk = {0xFF3D4757, kLight};
inline constexpr Ink kPassInk = {0xFF1F6B40, kLight};
inline constexpr Ink kFailInk = {0xFF9E2F2F, kLight};
/// Where keys have moved the mark.
inline constexpr Ink kMarkInk = {0xFFFFD24A, kDark};

/// All of them; a text can be read on each.
inline constexpr auto kInks = std::to_array<Ink>(
    {kPageInk, kHeadInk, kPanelInk, kButtonInk, kRowInk, kPassInk, kFailInk, kMarkInk});

}  // namespace factory_test
