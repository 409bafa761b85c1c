#include "layout.h"

#include <MW/window.h>
#include <brimol/display.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstring>
#include <string>
#include <string_view>

#include "utf8.h"

#include "language/language.h"
#include "text_fit.h"

namespace factory_test {

ScreenSize screenSize() {
  ScreenSize screen = {};
  MW::Window::getwindowsize(&screen.width, &screen.height);
  return screen;
}

namespace {

// Dots per inch; 0: unknown.
float density() {
  float across = 0;
  float down = 0;
  getDpi(&across, &down);
  return across;
}

}  // namespace

bool isDensityKnown() { return density() > 0; }

double pixelsPerMillimetre() {
  constexpr double kInch = 25.4;   // mm
  constexpr double kUsualMm = 65;  // a phone's shorter side
  const float dpi = density();
  if (dpi > 0) return dpi / kInch;
  const ScreenSize screen = screenSize();
  return std::min(screen.width, screen.height) / kUsualMm;
}

int pixelsOf(double millimetres, int least, int most) {
  return std::clamp(static_cast<int>(std::ceil(millimetres * pixelsPerMillimetre())), least, most);
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

SKIA_Text captionIn(const SKIA_Rect& area, const char* words, uint32_t color) {
  return captionIn(area, words, color, textSize(screenSize()));
}

SKIA_Text captionIn(const SKIA_Rect& area, const char* words, uint32_t color, int size) {
  const int margin = std::min(gapOf(screenSize()) / 2, area.w / 10);
  const FittedText fit = fitted(words, size, area.w - 2 * margin, area.h);
  std::string lines;
  for (const std::string& line : fit.lines) lines.append(lines.empty() ? "" : "\n").append(line);
  return textOf(lines.c_str(), color, SKIA_ALIGN_CENTRE, fit.size);
}

int leadingAlign() { return isRightToLeft() ? SKIA_ALIGN_RIGHT : SKIA_ALIGN_LEFT; }

void drawWords(const SKIA_Rect& area, std::string_view words, uint32_t color, int align, int size) {
  const FittedText fit = fitted(words, size, area.w, area.h);
  const int height = lineHeight(fit.size);
  const int all = height * static_cast<int>(fit.lines.size());
  SKIA_Rect row = {area.x, area.y + std::max((area.h - all) / 2, 0), area.w, height, area.color};
  for (const std::string& line : fit.lines) {
    skia_add_label_c(row, textOf(line.c_str(), color, align, fit.size));
    row.y += height;
  }
}

}  // namespace factory_test
