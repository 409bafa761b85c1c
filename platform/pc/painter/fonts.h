/// The project's own fonts, whatever the machine, its user and its settings prefer.
#pragma once

#include <memory>
#include <optional>
#include <span>
#include <string_view>

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

  /// What lays out a text, valid or not, from all the fonts. Where those that are quickly read draw
  /// all of it, the others are not read: since they come last, the text is the same without them.
  PangoContext* contextFor(std::string_view words);

 private:
  struct Context {
    explicit Context(std::span<const char* const> files);
    FontConfig config;
    FontMap map;
    TextContext placing;
  };

  bool isDrawnByCommon(gunichar letter) const;
  bool isDrawnByCommon(std::string_view words) const;

  Context common;
  CharacterSet commonCharacters;
  std::optional<Context> all;  // once a text has needed it
};

struct FontsReturner {
  void operator()(Fonts* fonts) const;
};

/// Fonts for one thread at a time. They are kept for the next borrower when they come back.
using BorrowedFonts = std::unique_ptr<Fonts, FontsReturner>;

/// Any thread may borrow.
BorrowedFonts borrowFonts();

}  // namespace brimol::pc
