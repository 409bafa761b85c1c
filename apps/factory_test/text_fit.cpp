#include "text_fit.h"

#include <algorithm>

namespace factory_test {

namespace {

constexpr int kWhole = 100;

// In hundredths of the text's size. The bytes of one character share its width.
int widthOf(char letter) {
  constexpr std::string_view kNarrow = " ijltfr.,:;!|'`()[]/\\-I";
  constexpr std::string_view kWide = "mwMW@%";
  constexpr int kNarrowWidth = 45;
  constexpr int kUsualWidth = 62;
  constexpr int kCapitalWidth = 72;
  constexpr int kWideWidth = 95;
  if (kNarrow.find(letter) != std::string_view::npos) return kNarrowWidth;
  if (kWide.find(letter) != std::string_view::npos) return kWideWidth;
  return letter >= 'A' && letter <= 'Z' ? kCapitalWidth : kUsualWidth;
}

// The widest run of so many bytes within a line.
int widestRun(std::string_view text, std::size_t count) {
  int widest = 0;
  int width = 0;
  std::size_t from = 0;
  for (std::size_t i = 0; i < text.size(); ++i) {
    if (text[i] == '\n') {
      width = 0;
      from = i + 1;
      continue;
    }
    width += widthOf(text[i]);
    if (i - from == count) width -= widthOf(text[from++]);
    widest = std::max(widest, width);
  }
  return widest;
}

}  // namespace

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
