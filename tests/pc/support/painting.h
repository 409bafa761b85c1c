/// What the tests of the painter share: items, pixels and pictures.
#pragma once

#include <brimol/scene.h>

#include <string>
#include <string_view>
#include <vector>

#include "painter/painter.h"

namespace brimol::pc {

using Area = cairo_rectangle_int_t;

inline constexpr uint32_t kBlack = 0xFF000000;
inline constexpr uint32_t kWhite = 0xFFFFFFFF;
inline constexpr uint32_t kRed = 0xFFFF0000;
inline constexpr uint32_t kBlue = 0xFF0000FF;

SKIA_Text textOf(std::string_view words, int32_t size = 20, uint32_t color = kWhite,
                 int32_t align = 1);
inline SKIA_Item boxItem(SKIA_Rect rect, int32_t kind = SKIA_BOX) { return {kind, rect, {}, {}}; }
inline SKIA_Item lineItem(SKIA_Point line) { return {SKIA_LINE, {}, line, {}}; }
inline SKIA_Item textItem(int32_t kind, SKIA_Rect rect, const SKIA_Text& text) {
  return {kind, rect, {}, text};
}

/// A picture's pixels by rows, 0x00RRGGBB.
struct Picture {
  Size size = {};
  std::vector<uint32_t> pixels = {};

  uint32_t at(int x, int y) const {
    return pixels.at(static_cast<std::size_t>(y) * static_cast<std::size_t>(size.w) +
                     static_cast<std::size_t>(x));
  }
  /// Pixels of the area that have another colour than `color`.
  int inkIn(const Area& area, uint32_t color = kBlack) const;
  /// The smallest rectangle around the pixels that are not black.
  Area inked() const;
  friend bool operator==(const Picture&, const Picture&) = default;
};

Picture pictureOf(cairo_surface_t* surface);
/// What a new painter shows of the frame.
Picture painted(const Frame& frame, Size screen = {100, 60});

}  // namespace brimol::pc

/// Region pieces compare as values.
bool operator==(const cairo_rectangle_int_t& one, const cairo_rectangle_int_t& other);
