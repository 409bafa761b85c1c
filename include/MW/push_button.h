/// What the push buttons have in common.
#pragma once

#include <MW/detail/delayed_show.h>
#include <MW/detail/double_tap.h>
#include <MW/widget.h>

namespace MW {

/// A face that turns kColorHighlight while a finger holds it. Button and Button3 say what stands on
/// it and where; this class is not used by itself.
///
/// A button enters the base layer when it is constructed, inactive, and stays there until it is
/// deleted or unregistered. A finger that presses it holds it until it lifts, wherever it moves;
/// the colour goes back to normal as soon as it moves out. Handlers run on the dispatch thread.
///
/// Callbacks, each a function of one int that is called with 0 on the dispatch thread:
/// `pressCallback`; `clickCallback`, released inside; `longPressCallback`, which also ends the
/// hold; `doubleClickCallback`, the second of two clicks of which each step took under 500 ms.
class MW_API PushButton : public Widget {
 public:
  using Widget::show;
  /// show(0): draws unless a delayed show is pending. Returns 1.
  int show() override;
  /// Raises the redraw flag once a delayed show is due.
  void updateTimer(unsigned int ticks) override;
  /// Makes it inactive and free, in its normal colour. Asks for no redraw. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// The colour it has now: the highlight while it is held.
  unsigned int getBgColor() override;
  SKIA_Rect* getPositionAndSize() override;
  /// Makes it active now, but visible and sensitive only in `ms` milliseconds.
  void onShowTimer(int ms) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPressLong(event_data* event) override;
  void onTouchClickCount() override;
  /// Takes the highlight away, and asks for a redraw if there was one.
  void restoreColor() override;

 protected:
  /// `logWord` speaks in the log and is a literal. The button is not registered yet.
  explicit PushButton(const char* logWord);

  unsigned int normalColor = 0;  // 0xAARRGGBB; guarded by stateLock
  DelayedShow delayedShow;       // guarded by stateLock
  DoubleTap clicks;              // dispatch thread

 private:
  bool moveAcross(event_data* event);
  bool isInside(const event_data* event) const;
  void setFace(unsigned int color);
  void restoreFace();

  const char* word;
};

}  // namespace MW
