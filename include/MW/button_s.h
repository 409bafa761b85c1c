/// Push buttons that do not light up: plain ones, such that pass their events on, framed ones.
#pragma once

#include <MW/push_button.h>

namespace MW {

/// What ButtonS and ButtonNew have in common; not used by itself.
///
/// They keep their colour while they are held. The style, which setButtonType() changes, is 0 for a
/// button box and any other value for a text box. A long press lets go of the finger with or
/// without a callback; a release inside after it is still a click.
class MW_API StyledButton : public PushButton {
 public:
  using PushButton::show;
  /// The face, unless a delayed show is pending. Returns 1.
  int show(unsigned int ticks) override;
  /// The colour until hide() or restoreColor() brings back that of the construction.
  void setBgColor(unsigned int color) override;
  void onPress(event_data* event) override;
  void onPressLong(event_data* event) override;

 protected:
  StyledButton(const char* logWord, int style, const SKIA_Rect* area, const SKIA_Text* caption);
  /// Under stateLock. False: it is not to be seen yet.
  bool drawFace(unsigned int ticks);
};

/// A push button that leaves its events to what lies below it if the bit of value 2 stands in its
/// style: it acts on them and yet reports them as not taken. Such a button is also clicked by a
/// finger that slides off it, as soon as a motion ends outside but within 20 pixels of an edge;
/// that ends the hold. A motion that ends further away does nothing.
class MW_API ButtonS : public StyledButton {
 public:
  /// Copies both records, of style 0. Null records: see primitives.h.
  ButtonS(const SKIA_Rect* area, const SKIA_Text* caption);
  ButtonS(int style, const SKIA_Rect* area, const SKIA_Text* caption);
  ~ButtonS() override;

  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onRelease(event_data* event) override;
  /// The click of a finger that slides off: nothing but for an event in the 20 pixels around.
  void onGetOutOfArea(event_data* event);
};

/// A push button with a frame of four lines if its style is 2. The frame is black without alpha,
/// which is nothing to be seen, and one pixel wide until it is set.
class MW_API ButtonNew : public StyledButton {
 public:
  /// Copies both records. Null records: see primitives.h.
  ButtonNew(int style, const SKIA_Rect* area, const SKIA_Text* caption);
  ~ButtonNew() override;

  using StyledButton::show;
  /// The face and then its frame: top, bottom, left, right.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onRelease(event_data* event) override;
  /// The frame's colour, and its width in pixels.
  void setBdColor(unsigned int color) override;
  void setBdWidth(int pixels);
};

}  // namespace MW
