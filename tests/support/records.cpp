#include "support/records.h"

#include <array>
#include <bit>

// The records are nothing but words, without gaps.
bool operator==(const SKIA_Rect& left, const SKIA_Rect& right) {
  using Words = std::array<int32_t, 5>;
  return std::bit_cast<Words>(left) == std::bit_cast<Words>(right);
}

bool operator==(const SKIA_Point& left, const SKIA_Point& right) {
  using Words = std::array<int32_t, 6>;
  return std::bit_cast<Words>(left) == std::bit_cast<Words>(right);
}

std::ostream& operator<<(std::ostream& out, const SKIA_Rect& rect) {
  return out << '(' << rect.x << ", " << rect.y << ") " << rect.w << " x " << rect.h << " 0x"
             << std::hex << rect.color << std::dec;
}

std::ostream& operator<<(std::ostream& out, const SKIA_Point& line) {
  return out << '(' << line.x1 << ", " << line.y1 << ") to (" << line.x2 << ", " << line.y2
             << ") 0x" << std::hex << line.color << std::dec << " width " << line.width;
}

namespace brimol::test {

std::ostream& operator<<(std::ostream& out, const Drawing& drawing) {
  static constexpr auto kNames =
      std::to_array<const char*>({"box", "round box", "line", "label", "textbox", "round textbox",
                                  "button box", "round button box", "static box", "arrow", "item"});
  return out << kNames.at(static_cast<std::size_t>(drawing.call)) << " kind " << drawing.kind
             << " rect " << drawing.rect << " line " << drawing.line << " text \""
             << drawing.text.text << "\" 0x" << std::hex << drawing.text.color << std::dec
             << " align " << drawing.text.align << " size " << drawing.text.size;
}

std::ostream& operator<<(std::ostream& out, const LogLine& line) {
  return out << line.priority << ' ' << line.tag << ": " << line.message;
}

SKIA_Text textRecord(const std::string& text, uint32_t color, int32_t align, int32_t size) {
  SKIA_Text record = {.text = {}, .string_len = 0, .color = color, .align = align, .size = size};
  record.string_len = static_cast<int32_t>(text.copy(record.text, SKIA_TEXT_BYTES - 1));
  return record;
}

}  // namespace brimol::test
