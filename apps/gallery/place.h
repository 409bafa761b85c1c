/// What the examples share: places, texts, and a line that says what happened.
#pragma once

#include <MW/records.h>
#include <MW/window.h>

#include <string>

namespace gallery {

inline constexpr uint32_t kGround = 0xFF405060;
inline constexpr uint32_t kFace = 0xFFB8C4D6;
inline constexpr uint32_t kDeep = 0xFF1D2A3A;

/// A rectangle in per cent of the screen.
inline SKIA_Rect place(int left, int top, int width, int height, uint32_t color = kFace) {
  const auto x = [](int percent) { return MW::Window::width * percent / 100; };
  const auto y = [](int percent) { return MW::Window::height * percent / 100; };
  return {x(left), y(top), x(width), y(height), color};
}

/// A text record, its letters a 36th of the screen's height.
inline SKIA_Text words(const std::string& text, uint32_t color = MW::kColorBlack,
                       int align = SKIA_ALIGN_CENTRE) {
  SKIA_Text record = {{}, 0, color, align, MW::Window::height / 36};
  record.string_len = static_cast<int32_t>(text.copy(record.text, SKIA_TEXT_BYTES - 1));
  return record;
}

inline constexpr float kTouchMm = 7.2F;  ///< what a finger hits
inline constexpr float kReadMm = 1.6F;   ///< letters that can be read

/// So many pixels, or those of a length in millimetres where that is more, and known.
int atLeastMm(int pixels, float mm);

/// The path of a picture of the program: one in the working directory, or beside the program, or
/// where it is installed.
std::string pictureFile(const std::string& name);

/// Shows a line: what an application does when it is told something. Any thread.
void say(const std::string& line);
/// The same, with a number behind it.
void say(const std::string& line, int64_t number);
/// What was said last; empty at first.
std::string said();

}  // namespace gallery
