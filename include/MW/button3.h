/// The verdict button of test screens.
#pragma once

#include <MW/push_button.h>

namespace MW {

/// A large white square with one or two captions. A position places it, not coordinates: three
/// squares fill the screen's width, in three rows. A number that is no position leaves the place
/// and size as they are: empty at first.
class MW_API Button3 : public PushButton {
 public:
  /// Where on the screen it stands.
  enum Position {
    kBottomLeft = 1,
    kBottomRight = 2,
    kBottomCentre = 5,
    kMiddleLeft = 7,
    kMiddleRight = 8,
    kMiddleCentre = 9,
    kTopLeft = 10,
    kTopRight = 11,
    kTopCentre = 12
  };

  /// Captioned by its position: kBottomLeft "PASS", kBottomCentre "RETRY", any other "FAIL". The
  /// caption is left-aligned, and invisible until setTextColor() and setFontSize() are called.
  explicit Button3(int position);
  /// Copies the captions. A null one is left out.
  Button3(int position, const SKIA_Text* first);
  /// `bottom`: pixels that stay free below the bottom row, in addition to the usual gap.
  Button3(int position, const SKIA_Text* first, int bottom);
  Button3(int position, const SKIA_Text* first, const SKIA_Text* second, int bottom);
  ~Button3() override;

  using PushButton::show;
  /// The face, and then its captions as labels, unless a delayed show is pending. Returns 1.
  int show(unsigned int ticks) override;
  // These read and write the first caption.
  char* getText() override;
  unsigned int getTextColor() override;
  int getFontSize() override;
  void setFontSize(int pixels) override;
  void setTextColor(unsigned int color) override;
  /// Replaces the first caption's characters but not its length, which stays that of construction:
  /// a longer text is cut to it, a shorter one filled up with NULs. Construct the button with the
  /// longest caption that it is to have.
  void setText(const char* newText) override;
  /// Places it anew on the present screen, in its normal colour. The rectangle is not read.
  void setRect(int position, const SKIA_Rect* unused) override;

  /// Already called by the constructors. Calling it again lays it out anew, inactive and without
  /// callbacks, and registers it a second time.
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
