#include "layout.h"

#include <MW/window.h>

#include <cstdio>
#include <cstring>

namespace factory_test {

ScreenSize screenSize() {
  ScreenSize screen = {};
  MW::Window::getwindowsize(&screen.width, &screen.height);
  return screen;
}

SKIA_Text textOf(const char* words, uint32_t color, int align, int size) {
  SKIA_Text text = {};
  std::snprintf(text.text, sizeof text.text, "%s", words);
  text.string_len = static_cast<int32_t>(std::strlen(text.text));
  text.color = color;
  text.align = align;
  text.size = size;
  return text;
}

SKIA_Text captionOf(const char* words, uint32_t color) {
  return textOf(words, color, SKIA_ALIGN_CENTRE, textSize(screenSize()));
}

}  // namespace factory_test
