/// Passive display elements of one drawing record each.
///
/// They are in no layer and get no events: the application calls their show(), or copies them to
/// the display-item table with add_MWWList(). Drawing and changing may happen on different threads.
/// Constructors copy their records; a null rectangle or line is all zero, a null text empty. A text
/// without a NUL in its record is cut to 127 bytes.
#pragma once

#include <MW/widget.h>

namespace MW {

/// What type() of a primitive says. Its kind in the display-item table (SKIA_ItemKind) is another.
enum PrimitiveType {
  kTypeLabel = 3,
  kTypeImage = 5,
  kTypeBox = 6,
  kTypeLine = 7,
  kTypeTextbox = 8
};

/// What labels and text boxes have in common; not used by itself.
class MW_API TextPrimitive : public Widget {
 public:
  char* getText() override;
  unsigned int getTextColor() override;
  int getFontSize() override;
  SKIA_Rect* getPositionAndSize() override;
  void setFontSize(int pixels) override;
  void setTextAlign(int align) override;
  /// Sets the fill colour; a label stores it but draws no fill. getBgColor() always returns 0.
  void setBgColor(unsigned int color) override;

 protected:
  /// Copies both records. `primitiveType`: a PrimitiveType.
  TextPrimitive(int primitiveType, const SKIA_Rect* area, const SKIA_Text* caption);
};

/// A text without a background.
class MW_API Label : public TextPrimitive {
 public:
  /// The text's length is taken from its NUL, not from `string_len`.
  Label(const SKIA_Rect* area, const SKIA_Text* caption);
  /// Draws it. Returns the platform's handle of the item.
  int show() override;
  int show(unsigned int ticks) override;
  /// Replaces the text's first bytes and its length and writes no NUL behind them: the platform
  /// goes by the length.
  void setText(const char* newText) override;
  int add_MWWList() override;
};

/// A text on a filled rectangle.
class MW_API Textbox : public TextPrimitive {
 public:
  /// The text's length is taken from its NUL, not from `string_len`.
  Textbox(const SKIA_Rect* area, const SKIA_Text* caption);
  /// Draws it. Returns the platform's handle of the item.
  int show() override;
  int show(unsigned int ticks) override;
  void setText(const char* newText) override;
  int add_MWWList() override;
};

/// A picture, named by a text that the platform understands (a file's path).
class MW_API Image : public Widget {
 public:
  /// Takes `string_len` bytes of the text, and none of the record's other fields. A negative length
  /// is 0; with a length over 127 the text ends at its NUL, or after 127 bytes.
  Image(const SKIA_Rect* area, const SKIA_Text* name);
  /// Draws it. Returns the platform's handle of the item. The drawing call is that of a label.
  int show() override;
  int show(unsigned int ticks) override;
  char* getText() override;
  SKIA_Rect* getPositionAndSize() override;
  /// As Label::setText.
  void setText(const char* newText) override;
  int add_MWWList() override;
};

/// A filled rectangle.
class MW_API Box : public Widget {
 public:
  /// Copies the record; its colour fills the box.
  explicit Box(const SKIA_Rect* area);
  /// Draws it. Returns the platform's handle of the item.
  int show() override;
  int show(unsigned int ticks) override;
  SKIA_Rect* getPositionAndSize() override;
  /// Sets the fill colour. getBgColor() always returns 0.
  void setBgColor(unsigned int color) override;
  int add_MWWList() override;
};

/// A straight line.
class MW_API Line : public Widget {
 public:
  /// Copies the record.
  explicit Line(const SKIA_Point* line);
  /// Draws it. Returns the platform's handle of the item.
  int show() override;
  int show(unsigned int ticks) override;
  /// The line's extent and colour. The rectangle starts at the larger x and y, and its width and
  /// height are zero or negative: it contains no point. For a hit test use (x + w, y + h) as the
  /// top left corner and (x, y) as the bottom right one.
  SKIA_Rect* getPositionAndSize() override;
  void setLnColor(unsigned int color) override;
  int add_MWWList() override;
};

}  // namespace MW
