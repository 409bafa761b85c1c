/// The plain push button.
#pragma once

#include <MW/push_button.h>

namespace MW {

/// A filled rectangle with a caption.
class MW_API Button : public PushButton {
 public:
  /// Copies both records; `area`'s colour is the normal colour. Null records: see primitives.h.
  Button(const SKIA_Rect* area, const SKIA_Text* caption);
  ~Button() override;

  using PushButton::show;
  /// One button box, unless a delayed show is pending. Returns 1.
  int show(unsigned int ticks) override;
  char* getText() override;
  unsigned int getTextColor() override;
  int getFontSize() override;
  void setFontSize(int pixels) override;
  void setText(const char* newText) override;
  void setTextColor(unsigned int color) override;
  /// Moves and resizes it; the colour and the first argument are not read. Null: no change.
  void setRect(int variant, const SKIA_Rect* newRect) override;
};

}  // namespace MW
