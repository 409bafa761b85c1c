/// What the examples share: places, texts, and a line that says what happened.
#pragma once

#include <brimol/scene.h>

#include <string>

namespace gallery {

inline constexpr uint32_t kGround = 0xFF405060;
inline constexpr uint32_t kFace = 0xFFB8C4D6;
inline constexpr uint32_t kDeep = 0xFF1D2A3A;

/// A rectangle in per cent of the screen.
SKIA_Rect place(int left, int top, int width, int height, uint32_t color = kFace);

/// A text record in the screen's usual letter size.
SKIA_Text words(const std::string& text, uint32_t color = 0xFF000000,
                int32_t align = SKIA_ALIGN_CENTRE);

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
