/// The texts that a user can read in a frame.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "scene/rectangles.h"
#include "scene/scene.h"

namespace brimol::pc {

struct ShownText {
  std::string text;  // without blanks at its ends
  Pixels area;       // of the item, as far as it is on the screen
  std::size_t item;  // its number in the frame
};

/// In drawing order. A text counts if something of its item is on the screen, and if no box that is
/// drawn after it covers the middle of that, be it a veil that lets it shine through.
std::vector<ShownText> shownTexts(const Frame& frame, Size screen);

/// A text that is looked for: pieces with anything between them.
class TextPattern {
 public:
  TextPattern() = default;
  /// One piece: that text alone.
  explicit TextPattern(std::vector<std::string> parts) : pieces(std::move(parts)) {}

  bool matches(std::string_view text) const;
  bool isFoundIn(std::string_view text) const;

 private:
  std::vector<std::string> pieces;
};

}  // namespace brimol::pc
