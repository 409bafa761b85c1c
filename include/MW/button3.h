/// The verdict button of test screens.
#pragma once

#include <MW/push_button.h>

namespace MW {

/// A large white square with one or two captions that is placed by a position number, not by
/// coordinates. Three of them fill the screen's width, in three rows:
///
///     position   left  centre  right
///     top          10      12     11
///     middle        7       9      8
///     bottom        1       5      2
///
/// Any other position leaves the place and size as they are: empty at first.
class MW_API Button3 : public PushButton {
 public:
  /// Captioned by its position: 1 "PASS", 5 "RETRY", any other "FAIL". The caption's colour,
  /// alignment and size are 0 until they are set.
  explicit Button3(int position);
  /// Copies the captions. A null one is left out.
  Button3(int position, const SKIA_Text* first);
  /// `bottom`: pixels that stay free below the bottom row.
  Button3(int position, const SKIA_Text* first, int bottom);
  Button3(int position, const SKIA_Text* first, const SKIA_Text* second, int bottom);
  ~Button3() override;

  using PushButton::show;
  /// The face, and then its captions as labels, unless a delayed show is pending. Returns 1.
  int show(unsigned int ticks) override;
  /// The first caption's, as the four that follow.
  char* getText() override;
  unsigned int getTextColor() override;
  int getFontSize() override;
  void setFontSize(int pixels) override;
  void setTextColor(unsigned int color) override;
  /// Replaces the first caption's characters but not its length: a longer text is cut to the length
  /// that the caption was given at construction, behind a shorter one stand NULs.
  void setText(const char* newText) override;
  /// Places it anew on the present screen, in its normal colour. The rectangle is not read.
  void setRect(int position, const SKIA_Rect* unused) override;

  /// What the constructors do: lays it out inactive, clears its callbacks, and registers it.
  void init(int position, const SKIA_Text* first, const SKIA_Text* second, int bottom);

 protected:
  // Guarded by stateLock.
  int bottomOffset = 0;  // pixels
  int captionCount = 0;  // 1 first caption, 2 both, each in half of the face
  SKIA_Text caption1 = {};
  SKIA_Text caption2 = {};
  SKIA_Rect labelRect1 = {};
  SKIA_Rect labelRect2 = {};

 private:
  void placeLabels();
};

}  // namespace MW
