#include "layout.h"

#include <MW/window.h>
#include <brimol/display.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstring>
#include <string_view>

namespace factory_test {

ScreenSize screenSize() {
  ScreenSize screen = {};
  MW::Window::getwindowsize(&screen.width, &screen.height);
  return screen;
}

int pixelsOf(double millimetres, int least, int most) {
  constexpr double kInch = 25.4;  // mm
  float across = 0;
  float down = 0;
  getDpi(&across, &down);
  return std::clamp(static_cast<int>(std::ceil(millimetres * across / kInch)), least, most);
}

int textSize(ScreenSize screen) {
  constexpr double kReadable = 2.2;  // mm
  constexpr int kLeast = 50;         // of the screen's longer side
  constexpr int kMost = 40;
  const int longer = std::max(screen.width, screen.height);
  return pixelsOf(kReadable, longer / kLeast, longer / kMost);
}

int smallTextSize(ScreenSize screen) {
  constexpr double kReadable = 1.6;  // mm
  constexpr int kPercent = 70;       // of the other texts
  const int most = textSize(screen);
  return pixelsOf(kReadable, percentOf(most, kPercent), most);
}

int entryHeight(ScreenSize screen) {
  constexpr double kFinger = 7.1;  // mm
  constexpr int kLeastPercent = 6;
  constexpr int kMostPercent = 11;
  const int longer = std::max(screen.width, screen.height);
  return pixelsOf(kFinger, percentOf(longer, kLeastPercent), percentOf(longer, kMostPercent));
}

int groupHeight(ScreenSize screen) {
  constexpr int kTextPercent = 150;
  return percentOf(textSize(screen), kTextPercent);
}

SKIA_Rect contentArea() { return layOutPage(screenSize()).content; }

namespace {

// So much of the text as ends with a whole character, at most `most` bytes.
std::size_t wholeBytes(std::string_view words, std::size_t most) {
  if (words.size() <= most) return words.size();
  const auto isInside = [&](std::size_t at) {
    constexpr unsigned kKind = 0xC0;
    constexpr unsigned kFollows = 0x80;
    return (static_cast<unsigned char>(words[at]) & kKind) == kFollows;
  };
  while (most > 0 && isInside(most)) --most;
  return most;
}

}  // namespace

SKIA_Text textOf(const char* words, uint32_t color, int align, int size) {
  SKIA_Text text = {};
  const std::size_t bytes = wholeBytes(words, sizeof text.text - 1);
  std::memcpy(text.text, words, bytes);
  text.string_len = static_cast<int32_t>(bytes);
  text.color = color;
  text.align = align;
  text.size = size;
  return text;
}

SKIA_Text captionOf(const char* words, uint32_t color) {
  return textOf(words, color, SKIA_ALIGN_CENTRE, textSize(screenSize()));
}

}  // namespace factory_test
