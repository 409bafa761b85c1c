/// The push button that can pass its events on.
#pragma once

#include <MW/styled_button.h>

namespace MW {

/// A push button that does not light up and that can leave its events to what lies below it.
///
/// With kPassOn in its style it acts on its events and still reports them as not taken. A finger
/// that slides off such a button clicks it: the first motion that ends outside, but within 20
/// pixels of an edge, calls `clickCallback` and ends the hold. A motion that ends further away does
/// nothing.
///
/// While a finger holds such a button, each event reaches it twice: once as a selected widget and
/// once as an active one. A release inside is then two clicks, and so a double click where
/// `doubleClickCallback` is set.
class MW_API ButtonS : public StyledButton {
 public:
  /// A bit of the style. On its own it is a style too: a text box that passes events on.
  enum StyleBit { kPassOn = 2 };

  /// Copies both records. The style is kButtonBox. Null records are all zero or empty.
  ButtonS(const SKIA_Rect* area, const SKIA_Text* caption);
  ButtonS(int style, const SKIA_Rect* area, const SKIA_Text* caption);
  ~ButtonS() override;

  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onRelease(event_data* event) override;
  /// The click of a finger that slides off. Does nothing unless the event lies in the 20 pixels
  /// around the button.
  void onGetOutOfArea(event_data* event);
};

}  // namespace MW
