/// Texts in UTF-8, byte by byte.
#pragma once

#include <algorithm>
#include <cstddef>
#include <string>
#include <string_view>

namespace factory_test {

/// Of a character all bytes but the first.
constexpr bool isInsideCharacter(char byte) {
  constexpr unsigned int kMask = 0xC0;
  constexpr unsigned int kFollowing = 0x80;
  return (static_cast<unsigned char>(byte) & kMask) == kFollowing;
}

/// Of ASCII: line ends, tabs and what else shows nothing.
constexpr bool isControl(char byte) {
  constexpr char kDelete = 0x7F;
  return (byte >= 0 && byte < ' ') || byte == kDelete;
}

/// So many bytes of the text as end with a whole character, at most `most`.
constexpr std::size_t wholeBytes(std::string_view text, std::size_t most) {
  if (text.size() <= most) return text.size();
  while (most > 0 && isInsideCharacter(text[most])) --most;
  return most;
}
static_assert(wholeBytes("a\xc3\xa4", 2) == 1);
static_assert(wholeBytes("a\xc3\xa4", 3) == 3);

/// The text as a message quotes it: of a long one so many bytes, and dots.
inline std::string shortened(std::string_view text, std::size_t most = 60) {
  const std::string_view shown = text.substr(0, wholeBytes(text, most));
  return std::string(shown) + (shown.size() < text.size() ? "..." : "");
}

/// The line, from 1, of the first NUL byte, which readers of JSON take for the text's end; 0: there
/// is none.
inline int lineOfNul(std::string_view text) {
  const std::size_t nul = text.find('\0');
  if (nul == std::string_view::npos) return 0;
  return 1 + static_cast<int>(std::ranges::count(text.substr(0, nul), '\n'));
}

}  // namespace factory_test
