/// What the recording platform records, as values that print and compare.
#pragma once

#include <brimol/scene.h>

#include <ostream>
#include <string>

/// The records have no operators of their own: they are C.
bool operator==(const SKIA_Rect& left, const SKIA_Rect& right);
bool operator==(const SKIA_Point& left, const SKIA_Point& right);
std::ostream& operator<<(std::ostream& out, const SKIA_Rect& rect);
std::ostream& operator<<(std::ostream& out, const SKIA_Point& line);

namespace brimol::test {

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
  std::string text;
  uint32_t color = 0;
  int32_t align = 0;
  int32_t size = 0;

  bool operator==(const DrawnText&) const = default;
};

/// One drawing call. What a call does not take stays zero.
struct Drawing {
  Call call = Call::Item;
  SKIA_Rect rect = {};
  SKIA_Point line = {};
  DrawnText text = {};
  int32_t kind = 0;  // of an item record

  bool operator==(const Drawing&) const = default;
};
std::ostream& operator<<(std::ostream& out, const Drawing& drawing);

/// One log line; its text is what stands behind the tag.
struct LogLine {
  int priority;  // 3 debug, 5 warning, 6 error
  std::string tag;
  std::string message;

  bool operator==(const LogLine&) const = default;
};
std::ostream& operator<<(std::ostream& out, const LogLine& line);

/// A text record that holds `text`, cut to what it takes, with length, and the given looks.
SKIA_Text textRecord(const std::string& text, uint32_t color = 0, int32_t align = 0,
                     int32_t size = 0);

}  // namespace brimol::test
