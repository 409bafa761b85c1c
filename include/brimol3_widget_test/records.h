/// What the recording platform records, as values that print and compare.
#pragma once

#include <brimol/scene.h>

#include <algorithm>
#include <array>
#include <bit>
#include <iomanip>
#include <ostream>
#include <string>
#include <vector>

// The records of C have no operators of their own. They are nothing but words, without gaps.
inline bool operator==(const SKIA_Rect& left, const SKIA_Rect& right) {
  using Words = std::array<int32_t, 5>;
  return std::bit_cast<Words>(left) == std::bit_cast<Words>(right);
}

inline bool operator==(const SKIA_Point& left, const SKIA_Point& right) {
  using Words = std::array<int32_t, 6>;
  return std::bit_cast<Words>(left) == std::bit_cast<Words>(right);
}

inline std::ostream& operator<<(std::ostream& out, const SKIA_Rect& rect) {
  return out << '(' << rect.x << ", " << rect.y << ") " << rect.w << " x " << rect.h << " 0x"
             << std::hex << rect.color << std::dec;
}

inline std::ostream& operator<<(std::ostream& out, const SKIA_Point& line) {
  return out << '(' << line.x1 << ", " << line.y1 << ") to (" << line.x2 << ", " << line.y2
             << ") 0x" << std::hex << line.color << std::dec << " width " << line.width;
}

inline std::ostream& operator<<(std::ostream& out, const SKIA_Text& text) {
  const auto length = std::clamp<int32_t>(text.string_len, 0, SKIA_TEXT_BYTES);
  return out << std::quoted(std::string(text.text, static_cast<std::size_t>(length))) << " length "
             << text.string_len << " 0x" << std::hex << text.color << std::dec << " align "
             << text.align << " size " << text.size;
}

namespace brimol::test {

/// The drawing call that was made.
enum class Call {
  Box,
  RoundBox,
  Line,
  Label,
  Textbox,
  RoundTextbox,
  ButtonBox,
  RoundButtonBox,
  StaticBox,
  Arrow,
  Item
};

/// A text record as it is drawn: its first `string_len` bytes.
struct DrawnText {
  std::string text;    ///< the bytes
  uint32_t color = 0;  ///< 0xAARRGGBB
  int32_t align = 0;   ///< enum SKIA_Align
  int32_t size = 0;    ///< pixels

  bool operator==(const DrawnText&) const = default;
};

/// One drawing call. What a call does not take stays zero.
struct Drawing {
  Call call = Call::Item;  ///< which one
  SKIA_Rect rect = {};     ///< what it was given
  SKIA_Point line = {};    ///< the same
  DrawnText text = {};     ///< the same
  int32_t kind = 0;        ///< of an item record

  bool operator==(const Drawing&) const = default;
};
inline std::ostream& operator<<(std::ostream& out, const Drawing& drawing) {
  return out << "call " << static_cast<int>(drawing.call) << " kind " << drawing.kind << " rect "
             << drawing.rect << " line " << drawing.line << " text \"" << drawing.text.text
             << "\" 0x" << std::hex << drawing.text.color << std::dec << " align "
             << drawing.text.align << " size " << drawing.text.size;
}

/// The display items of one picture, in the order in which they are drawn.
using Frame = std::vector<SKIA_Item>;

/// The item that the call adds.
SKIA_Item itemOf(const Drawing& drawing);
/// The items of several calls.
Frame itemsOf(const std::vector<Drawing>& drawings);
/// A line for each item: its kind, rectangle, line and text, as far as it has them.
std::string textOf(const Frame& frame);

/// One log line; its text is what stands behind the tag.
struct LogLine {
  int priority;         ///< 3 debug, 5 warning, 6 error
  std::string tag;      ///< who logged
  std::string message;  ///< what

  bool operator==(const LogLine&) const = default;
};
inline std::ostream& operator<<(std::ostream& out, const LogLine& line) {
  return out << line.priority << ' ' << line.tag << ": " << line.message;
}

/// A text record that holds `text`, cut to what it takes, with length, and the given looks.
inline SKIA_Text textRecord(const std::string& text, uint32_t color = 0, int32_t align = 0,
                            int32_t size = 0) {
  SKIA_Text record = {.text = {}, .string_len = 0, .color = color, .align = align, .size = size};
  record.string_len = static_cast<int32_t>(text.copy(record.text, SKIA_TEXT_BYTES - 1));
  return record;
}

}  // namespace brimol::test
