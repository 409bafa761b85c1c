#include "scene/quoted_text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <system_error>

namespace brimol::pc {

namespace {

struct Escape {
  char letter;
  char plain;
};
constexpr auto kEscapes =
    std::to_array<Escape>({{'"', '"'}, {'\\', '\\'}, {'n', '\n'}, {'t', '\t'}, {'*', '*'}});
constexpr std::string_view kHexDigits = "0123456789abcdef";
constexpr int kHexBase = 16;
constexpr std::size_t kByteDigits = 2;

bool isControl(char letter) {
  constexpr char kDelete = '\x7f';
  return (letter >= '\0' && letter < ' ') || letter == kDelete;
}

// Takes the two digits away.
std::optional<char> byteOf(std::string_view& rest) {
  if (rest.size() < kByteDigits) return std::nullopt;
  unsigned int byte = 0;
  const char* const end = rest.data() + kByteDigits;
  const auto [stop, failure] = std::from_chars(rest.data(), end, byte, kHexBase);
  if (failure != std::errc() || stop != end) return std::nullopt;
  rest.remove_prefix(kByteDigits);
  return static_cast<char>(byte);
}

// The escape behind a backslash.
std::optional<char> escapeOf(std::string_view& rest) {
  if (rest.empty()) return std::nullopt;
  const char letter = rest.front();
  rest.remove_prefix(1);
  if (letter == 'x') return byteOf(rest);
  const auto* const row = std::ranges::find(kEscapes, letter, &Escape::letter);
  return row == kEscapes.end() ? std::nullopt : std::optional(row->plain);
}

}  // namespace

std::string inQuotes(std::string_view text) {
  std::string out = "\"";
  for (const char each : text) {
    const auto* const row = std::ranges::find(kEscapes, each, &Escape::plain);
    if (row != kEscapes.end() && each != '*') {
      out.append({'\\', row->letter});
    } else if (isControl(each)) {
      const auto byte = static_cast<unsigned char>(each);
      out.append({'\\', 'x', kHexDigits[byte / kHexBase], kHexDigits[byte % kHexBase]});
    } else {
      out += each;
    }
  }
  return out + '"';
}

std::optional<std::string> unescaped(std::string_view inside) {
  std::string text;
  while (!inside.empty()) {
    std::optional<char> letter = inside.front();
    inside.remove_prefix(1);
    if (letter == '\\') letter = escapeOf(inside);
    if (!letter) return std::nullopt;
    text += *letter;
  }
  return text;
}

std::string printable(std::string text) {
  std::ranges::replace_if(text, isControl, '?');
  return text;
}

}  // namespace brimol::pc
