/// Texts in UTF-8, byte by byte.
#pragma once

#include <cstddef>
#include <string_view>

namespace brimol::pc {

/// Of a character all bytes but the first.
constexpr bool isInsideCharacter(char byte) {
  constexpr unsigned int kMask = 0xC0;
  constexpr unsigned int kFollowing = 0x80;
  return (static_cast<unsigned char>(byte) & kMask) == kFollowing;
}

/// So many bytes of the text as end with a whole character, at most `most`.
constexpr std::size_t wholeBytes(std::string_view text, std::size_t most) {
  if (text.size() <= most) return text.size();
  while (most > 0 && isInsideCharacter(text[most])) --most;
  return most;
}

}  // namespace brimol::pc
