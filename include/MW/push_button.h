/// What the push buttons have in common.
#pragma once

#include <MW/button_face.h>
#include <MW/detail/delayed_show.h>
#include <MW/detail/double_tap.h>

namespace MW {

/// A face that a finger presses. While it is held it has the colour kColorHighlight, unless
/// its class says otherwise. Button, Button3, ButtonS and ButtonNew say what stands on it and
/// where; this class is not used by itself.
///
/// A button enters the base layer when it is constructed, inactive, and stays there until it is
/// deleted or unregistered. A finger that presses it holds it, wherever it moves; the colour goes
/// back to normal as soon as a finger moves outside. Handlers run on the dispatch thread.
///
/// A held button takes the touches of every finger, wherever they are: a press of a second one is a
/// press of the button, and the first release of any finger ends the hold.
///
/// Callbacks, each a function of one int that is called with 0 on the dispatch thread:
/// `pressCallback`; `clickCallback`, a release inside, even if the press was elsewhere;
/// `longPressCallback`, which also ends the hold; `doubleClickCallback`, the second of two clicks,
/// the first released within 500 ms of its press, the second within 500 ms of the first.
class MW_API PushButton : public ButtonFace {
 public:
  using Widget::show;
  /// show(0), but nothing while a delayed show is pending, due or not. Returns 1.
  int show() override;
  /// Raises the redraw flag once a delayed show is due.
  void updateTimer(unsigned int ticks) override;
  /// Makes it inactive and free, in its normal colour. Does not ask for a redraw. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// Makes it active now. It appears, and takes touches, from the first drawing pass at least `ms`
  /// milliseconds from now.
  void onShowTimer(int ms) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPressLong(event_data* event) override;
  void onTouchClickCount() override;

 protected:
  using ButtonFace::ButtonFace;

  /// Whether an event is the button's at all: one inside, or any while it is held.
  bool isReachedBy(const event_data* event) const;
  /// Passes a press, release or long press to its operation. False: it is another event.
  bool handleGesture(event_data* event);
  /// What every press does: the finger takes the button, and the application is told. The button
  /// may be gone afterwards.
  void holdBy(const event_data* event);
  /// What every release does: inside, a click, and perhaps a double click. The button may be gone
  /// afterwards.
  void clickAt(const event_data* event);

  DelayedShow delayedShow;  // guarded by stateLock
  DoubleTap clicks;         // dispatch thread

 private:
  bool moveAcross(event_data* event);
};

}  // namespace MW
