/// What tests expect of drawing, short enough for tables, and the screens that they draw on.
#pragma once

#include <MW/window.h>

#include <climits>
#include <utility>

#include "support/widget_test.h"

namespace brimol::test {

inline void setScreen(int w, int h) {
  MW::Window::width = w;
  MW::Window::height = h;
}

inline Drawing box(SKIA_Rect rect) { return {.call = Call::Box, .rect = rect}; }
inline Drawing roundBox(SKIA_Rect rect) { return {.call = Call::RoundBox, .rect = rect}; }
inline Drawing line(SKIA_Point points) { return {.call = Call::Line, .line = points}; }
inline Drawing label(SKIA_Rect rect, DrawnText text) {
  return {.call = Call::Label, .rect = rect, .text = std::move(text)};
}
inline Drawing textbox(SKIA_Rect rect, DrawnText text) {
  return {.call = Call::Textbox, .rect = rect, .text = std::move(text)};
}
inline Drawing roundTextbox(SKIA_Rect rect, DrawnText text) {
  return {.call = Call::RoundTextbox, .rect = rect, .text = std::move(text)};
}
inline Drawing buttonBox(SKIA_Rect rect, DrawnText text) {
  return {.call = Call::ButtonBox, .rect = rect, .text = std::move(text)};
}

/// Screens that no machine has: 0 is the default size, the others are taken as they are.
inline constexpr auto kHostileSizes = {0, 1, 7, -1, -1080, INT_MIN, INT_MAX};

/// A record without a NUL.
inline SKIA_Text endlessText(char byte) {
  SKIA_Text record = {};
  for (char& each : record.text) each = byte;
  record.string_len = INT_MAX;
  return record;
}

/// A number of NULs: what a record's length covers beyond its text.
inline std::string nuls(std::size_t count) {
  std::string text;
  text.resize(count);
  return text;
}

}  // namespace brimol::test
