/// What push buttons that do not light up have in common.
#pragma once

#include <MW/push_button.h>

namespace MW {

/// A push button that keeps its colour while it is held. ButtonS and ButtonNew add to it; this
/// class is not used by itself.
///
/// A long press lets go of the finger, with or without a callback; a release inside after it is
/// still a click.
class MW_API StyledButton : public PushButton {
 public:
  /// The style, which a constructor takes and setButtonType() changes. Any value but 0 draws a text
  /// box.
  enum Style { kButtonBox = 0, kTextBox = 1 };

  using PushButton::show;
  /// The face, unless a delayed show is pending. Returns 1.
  int show(unsigned int ticks) override;
  /// Changes the colour until hide() or restoreColor() brings back that of the construction.
  void setBgColor(unsigned int color) override;
  void onPress(event_data* event) override;
  void onPressLong(event_data* event) override;

 protected:
  /// See ButtonFace.
  StyledButton(const char* logWord, int style, const SKIA_Rect* area, const SKIA_Text* caption);
  /// Under stateLock. False: a delayed show is pending, and nothing was drawn.
  bool drawFace(unsigned int ticks);
};

}  // namespace MW
