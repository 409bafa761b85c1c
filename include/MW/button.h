/// The plain push button.
#pragma once

#include <MW/detail/delayed_show.h>
#include <MW/detail/double_tap.h>
#include <MW/widget.h>

namespace MW {

/// A filled rectangle with a caption that turns kColorHighlight while a finger holds it.
///
/// It enters the base layer when it is constructed, inactive, and stays there until it is deleted
/// or unregistered. A finger that presses it holds it until it lifts, wherever it moves; the colour
/// goes back to normal as soon as it moves out. Handlers run on the dispatch thread.
///
/// Callbacks, each a function of one int that is called with 0 on the dispatch thread:
/// `pressCallback`; `clickCallback`, released inside; `longPressCallback`, which also ends the
/// hold; `doubleClickCallback`, the second of two clicks of which each step took under 500 ms.
class MW_API Button : public Widget {
 public:
  /// Copies both records; `area`'s colour is the normal colour. Null records: see primitives.h.
  Button(const SKIA_Rect* area, const SKIA_Text* caption);
  ~Button() override;

  /// show(0): draws unless a delayed show is pending. Returns 1.
  int show() override;
  int show(unsigned int ticks) override;
  /// Raises the redraw flag once a delayed show is due.
  void updateTimer(unsigned int ticks) override;
  /// Makes it inactive and free, in its normal colour. Asks for no redraw. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  char* getText() override;
  /// The colour it has now: the highlight while it is held.
  unsigned int getBgColor() override;
  unsigned int getTextColor() override;
  int getFontSize() override;
  SKIA_Rect* getPositionAndSize() override;
  void setFontSize(int pixels) override;
  void setText(const char* newText) override;
  void setTextColor(unsigned int color) override;
  /// Makes it active now, but visible and sensitive only in `ms` milliseconds.
  void onShowTimer(int ms) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPressLong(event_data* event) override;
  /// Moves and resizes it; the colour and the first argument are not read. Null: no change.
  void setRect(int variant, const SKIA_Rect* newRect) override;
  void onTouchClickCount() override;
  /// Takes the highlight away, and asks for a redraw if there was one.
  void restoreColor() override;

 protected:
  unsigned int normalColor;  // 0xAARRGGBB
  DelayedShow delayedShow;   // guarded by stateLock
  DoubleTap clicks;          // dispatch thread

 private:
  bool moveAcross(event_data* event);
  bool isInside(const event_data* event) const;
  void setFace(unsigned int color);
};

}  // namespace MW
