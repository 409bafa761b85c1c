/// What all buttons have in common.
#pragma once

#include <MW/widget.h>

namespace MW {

/// A rectangle with a caption and a normal colour to come back to; not used by itself.
class MW_API ButtonFace : public Widget {
 public:
  char* getText() override;
  /// The colour it has now.
  unsigned int getBgColor() override;
  unsigned int getTextColor() override;
  int getFontSize() override;
  SKIA_Rect* getPositionAndSize() override;
  void setFontSize(int pixels) override;
  void setText(const char* newText) override;
  void setTextColor(unsigned int color) override;
  /// Moves and resizes it. The colour and the first argument are not read. Null: no change.
  void setRect(int variant, const SKIA_Rect* newRect) override;
  /// Gives it its normal colour, and asks for a redraw if it had another.
  void restoreColor() override;

 protected:
  /// `logWord` begins the log lines and is a literal. Copies both records; `area`'s colour is the
  /// normal colour. Null records are all zero or empty. The button is not registered yet.
  ButtonFace(const char* logWord, const SKIA_Rect* area, const SKIA_Text* caption);
  /// Registers the button, with a log line that names the constructor.
  void enterWindow(int constructorNumber);
  /// Gives it its normal colour, and asks for nothing.
  void restoreFace();

  const char* word;              // begins the log lines
  unsigned int normalColor = 0;  // 0xAARRGGBB; guarded by stateLock
};

}  // namespace MW
