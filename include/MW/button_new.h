/// The push button with a frame.
#pragma once

#include <MW/styled_button.h>

namespace MW {

/// A push button that does not light up, with a frame of four lines if its style is kFramed.
class MW_API ButtonNew : public StyledButton {
 public:
  /// A text box with a frame. The frame cannot be seen until setBdColor() gives it a colour.
  enum FramedStyle { kFramed = 2 };

  /// Copies both records. Null records are all zero or empty.
  ButtonNew(int style, const SKIA_Rect* area, const SKIA_Text* caption);
  ~ButtonNew() override;

  using StyledButton::show;
  /// The face and then its frame: top, bottom, left, right. Returns 1.
  int show(unsigned int ticks) override;
  /// Motions are not taken.
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onRelease(event_data* event) override;
  /// The frame's colour, 0 until it is set, and its width, 1 pixel until it is set.
  void setBdColor(unsigned int color) override;
  void setBdWidth(int pixels);
};

}  // namespace MW
