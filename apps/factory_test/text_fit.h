/// What has room in a place. No platform measures letters for an application: they are taken for a
/// little wider than their kind is in common fonts.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace factory_test {

/// Pixels of a line of UTF-8 in letters of that size.
int widthOf(std::string_view line, int size);

/// The lines of a text, none wider than `width`: cut at blanks, and inside a word only where that
/// alone is wider.
std::vector<std::string> wrapped(std::string_view text, int size, int width);

/// Lines of a text, and the size of their letters.
struct FittedText {
  std::vector<std::string> lines;
  int size;
};

/// From one line to the next.
int lineHeight(int size);

/// The text as large as it fits, at most in letters of `size` and at least in half as large ones,
/// in which it may be too high.
FittedText fitted(std::string_view text, int size, int width, int height);

/// The bytes of which a row of `width` pixels surely holds any that follow each other in a line of
/// the text, at most `most`.
std::size_t bytesThatFit(std::string_view text, int size, int width, std::size_t most);

}  // namespace factory_test
