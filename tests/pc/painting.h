/// What the tests of the painter share: items, pixels and pictures.
#pragma once

#include <brimol/scene.h>

#include <string>
#include <string_view>
#include <vector>

#include "cairo_handles.h"
#include "painter.h"
#include "painter/canvas.h"

namespace brimol::pc {

inline constexpr uint32_t kBlack = 0xFF000000;
inline constexpr uint32_t kWhite = 0xFFFFFFFF;
inline constexpr uint32_t kRed = 0xFFFF0000;
inline constexpr uint32_t kBlue = 0xFF0000FF;

SKIA_Text textOf(std::string_view words, int32_t size = 20, uint32_t color = kWhite,
                 int32_t align = 1);
SKIA_Item boxItem(SKIA_Rect rect, int32_t kind = SKIA_BOX);
SKIA_Item textItem(int32_t kind, SKIA_Rect rect, const SKIA_Text& text);
SKIA_Item lineItem(SKIA_Point line);
SKIA_Item arrowItem(SKIA_Rect rect, uint32_t color, int32_t direction);

/// A picture's pixels by rows, 0x00RRGGBB.
struct Picture {
  Size size = {};
  std::vector<uint32_t> pixels = {};

  uint32_t at(int x, int y) const {
    return pixels[static_cast<std::size_t>(y) * static_cast<std::size_t>(size.w) +
                  static_cast<std::size_t>(x)];
  }
  /// Pixels of the area that have another colour than `color`.
  int inkIn(const cairo_rectangle_int_t& area, uint32_t color = kBlack) const;
  /// The smallest rectangle around the pixels that are not black.
  cairo_rectangle_int_t inked() const;
  friend bool operator==(const Picture&, const Picture&) = default;
};

Picture pictureOf(cairo_surface_t* surface);
/// What a new painter shows of the frame.
Picture painted(const Frame& frame, Size screen = {100, 60});

/// Writes a PNG file of one colour for the test that runs, and returns its name.
std::string writePicture(const std::string& name, Size size, uint32_t color);

}  // namespace brimol::pc

/// Region pieces compare and print as values.
bool operator==(const cairo_rectangle_int_t& one, const cairo_rectangle_int_t& other);
void PrintTo(const cairo_rectangle_int_t& area, std::ostream* out);
