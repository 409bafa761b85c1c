/// The project's own fonts, whatever the machine, its user and its settings prefer.
#pragma once

#include <memory>

#include "painter/text_handles.h"

namespace brimol::pc {

/// The description of the project's fonts at `size` pixels.
FontDescription projectFonts(int size);

/// The fonts, and how their glyphs are placed and rendered. A file that cannot be used is told on
/// stderr and left out; texts are drawn with the others.
class Fonts {
 public:
  Fonts();
  ~Fonts() = delete;
  Fonts(const Fonts&) = delete;
  Fonts& operator=(const Fonts&) = delete;

  PangoContext* context() const { return placing.get(); }

 private:
  FontConfig config;
  FontMap map;
  TextContext placing;
};

struct FontsReturner {
  void operator()(Fonts* fonts) const;
};

/// Fonts for one thread at a time. They are kept for the next borrower when they come back.
using BorrowedFonts = std::unique_ptr<Fonts, FontsReturner>;

/// Any thread may borrow.
BorrowedFonts borrowFonts();

}  // namespace brimol::pc
