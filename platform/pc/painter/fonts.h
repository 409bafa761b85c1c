/// The project's own fonts, whatever the machine, its user and its settings prefer.
#pragma once

#include <span>

#include "painter/text_handles.h"

namespace brimol::pc {

/// The font files in which texts are drawn, the preferred one first.
std::span<const char* const> projectFontFiles();

/// The description of those fonts at `size` pixels.
FontDescription projectFonts(int size);

/// The fonts, and how their glyphs are placed and rendered. One thread uses it.
class Fonts {
 public:
  /// A file that cannot be used is told on stderr and left out; texts are drawn with the others.
  explicit Fonts(std::span<const char* const> files);
  ~Fonts();
  Fonts(const Fonts&) = delete;
  Fonts& operator=(const Fonts&) = delete;

  PangoContext* context() const { return placing.get(); }

 private:
  FontConfig config;
  FontMap map;
  TextContext placing;
};

}  // namespace brimol::pc
