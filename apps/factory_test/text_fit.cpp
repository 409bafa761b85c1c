#include "text_fit.h"

#include <algorithm>
#include <array>
#include <utility>

#include "utf8.h"

namespace factory_test {

namespace {

constexpr int kWhole = 100;

// Letters that lie between two characters.
struct Script {
  char32_t first;
  char32_t last;
  int width;  // in hundredths of the text's size
};
// Ascending.
constexpr auto kScripts = std::to_array<Script>({
    {0xB7, 0xB7, 30},      // middle dot
    {0xC0, 0xDE, 70},      // Latin capitals with accents
    {0x300, 0x36F, 0},     // accents
    {0x600, 0x64A, 58},    // Arabic
    {0x64B, 0x65F, 0},     // its vowel signs
    {0x1100, 0x11FF, 95},  // Korean, Chinese, Japanese
    {0x2E80, 0xD7FF, 95},
    {0xF900, 0xFAFF, 95},
    {0xFF00, 0xFFEF, 95},
});
constexpr int kUsualWidth = 60;

// Letters of about one width.
struct LetterKind {
  std::u32string_view letters;
  int width;  // in hundredths of the text's size
};
constexpr auto kLetterKinds = std::to_array<LetterKind>({
    {U" ijl.,:;'|!`()[]I", 30},
    {U"frt\"-/\\{}", 42},
    {U"cksvxyzJ", 52},
    {U"abdeghnopqu0123456789", 58},
    {U"w", 78},
    {U"mMW@%", 94},
    {U"ABCDEFGHKLNOPQRSTUVXYZ", 70},
});

int widthOfLetter(char32_t letter) {
  for (const LetterKind& kind : kLetterKinds) {
    if (kind.letters.find(letter) != std::u32string_view::npos) return kind.width;
  }
  const auto* const script = std::ranges::lower_bound(kScripts, letter, {}, &Script::last);
  return script != kScripts.end() && script->first <= letter ? script->width : kUsualWidth;
}

// The bytes of the character at the text's beginning.
std::size_t firstCharacter(std::string_view text) {
  std::size_t bytes = std::min<std::size_t>(text.size(), 1);
  while (bytes < text.size() && isInsideCharacter(text[bytes])) ++bytes;
  return bytes;
}

char32_t letterOf(std::string_view character) {
  constexpr std::array<unsigned, 5> kPayload = {0, 0x7F, 0x1F, 0x0F, 0x07};  // by its bytes
  constexpr unsigned kFollowing = 0x3F;
  const auto first = static_cast<unsigned char>(character.front());
  char32_t letter = first & kPayload.at(std::min<std::size_t>(character.size(), 4));
  for (const char byte : character.substr(1)) {
    letter = letter << 6 | (static_cast<unsigned char>(byte) & kFollowing);
  }
  return letter;
}

// The widest run of so many bytes within a line. The bytes of one character share its width.
int widestRun(std::string_view text, std::size_t count) {
  const auto widthOfByte = [](char byte) {
    return widthOfLetter(static_cast<unsigned char>(byte) < 0x80 ? static_cast<char32_t>(byte) : 0);
  };
  int widest = 0;
  int width = 0;
  std::size_t from = 0;
  for (std::size_t i = 0; i < text.size(); ++i) {
    if (text[i] == '\n') {
      width = 0;
      from = i + 1;
      continue;
    }
    width += widthOfByte(text[i]);
    if (i - from == count) width -= widthOfByte(text[from++]);
    widest = std::max(widest, width);
  }
  return widest;
}

// Takes from the text's beginning what has room in a line.
std::string_view takeLetters(std::string_view& text, int size, int width) {
  std::size_t bytes = firstCharacter(text);
  while (bytes < text.size()) {
    const std::size_t next = bytes + firstCharacter(text.substr(bytes));
    if (widthOf(text.substr(0, next), size) > width) break;
    bytes = next;
  }
  const std::string_view taken = text.substr(0, bytes);
  text.remove_prefix(bytes);
  return taken;
}

// The same, cut at a blank where there is one.
std::string_view takeLine(std::string_view& text, int size, int width) {
  const std::string_view whole = text;
  const std::string_view letters = takeLetters(text, size, width);
  if (text.empty()) return letters;
  const std::size_t blank = whole.substr(0, letters.size() + 1).rfind(' ');
  if (blank == std::string_view::npos || blank == 0) return letters;
  text = whole.substr(blank + 1);
  return whole.substr(0, blank);
}

bool hasRoom(const FittedText& text, const FittedText& words, int width, int height) {
  const auto isNarrow = [&](const std::string& line) { return widthOf(line, text.size) <= width; };
  return std::cmp_less_equal(text.lines.size() * static_cast<std::size_t>(lineHeight(text.size)),
                             height) &&
         std::ranges::all_of(words.lines, isNarrow);
}

std::vector<std::string> split(std::string_view text, std::string_view ends) {
  std::vector<std::string> parts;
  while (true) {
    const std::size_t end = text.find_first_of(ends);
    parts.emplace_back(text.substr(0, end));
    if (end == std::string_view::npos) return parts;
    text.remove_prefix(end + 1);
  }
}

}  // namespace

int widthOf(std::string_view line, int size) {
  int width = 0;
  while (!line.empty()) {
    const std::size_t bytes = firstCharacter(line);
    width += widthOfLetter(letterOf(line.substr(0, bytes)));
    line.remove_prefix(bytes);
  }
  return width * size / kWhole;
}

std::vector<std::string> wrapped(std::string_view text, int size, int width) {
  std::vector<std::string> lines;
  for (const std::string& line : split(text, "\n")) {
    std::string_view rest = line;
    do lines.emplace_back(takeLine(rest, size, width));
    while (!rest.empty());
  }
  return lines;
}

int lineHeight(int size) {
  constexpr int kPercent = 135;
  return size * kPercent / kWhole;
}

FittedText fitted(std::string_view text, int size, int width, int height) {
  constexpr int kLeastPercent = 50;
  constexpr int kStepPercent = 5;
  const FittedText words = {split(text, " \n"), size};
  FittedText fit = {{}, size};
  for (int percent = kWhole; percent >= kLeastPercent; percent -= kStepPercent) {
    fit.size = size * percent / kWhole;
    fit.lines = wrapped(text, fit.size, width);
    if (hasRoom(fit, words, width, height)) break;
  }
  return fit;
}

std::size_t bytesThatFit(std::string_view text, int size, int width, std::size_t most) {
  const int room = width * kWhole / std::max(size, 1);
  std::size_t count = most;
  while (count > 1) {
    const int widest = widestRun(text, count);
    if (widest <= room) break;
    const auto scaled =
        count * static_cast<std::size_t>(std::max(room, 1)) / static_cast<std::size_t>(widest);
    count = std::max<std::size_t>(std::min(scaled, count - 1), 1);
  }
  return count;
}

}  // namespace factory_test
