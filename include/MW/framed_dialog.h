/// What the dialogs with buttons have in common.
#pragma once

#include <MW/detail/dialog_frame.h>
#include <MW/widget.h>

namespace MW {

/// A frame in the middle of the screen: a title, a body, and below it up to two buttons. The
/// classes derived from it say what stands in the body; this class is not used by itself.
///
/// A dialog enters the top layer when it is constructed, inactive, and leaves it when it is
/// deleted. While it is active nothing below gets events. Handlers run on the dispatch thread.
///
/// A button turns kColorHighlight while a finger holds it; a finger that moves off it takes the
/// highlight away, and one that lifts on it, wherever it came from, makes it answer.
///
/// Callbacks of one int, called with 0: `button1Callback` (left; the dialog stays) and
/// `button2Callback` (right; the dialog has hidden itself before). Of one mouse_event*:
/// `pressCallback`, `hoverCallback`, `clickCallback` (any touch, any place, the last one at its
/// release). Of one kbd_event*: `keyPressCallback`, `keyReleaseCallback`. Records are valid for the
/// call.
class MW_API FramedDialog : public Widget {
 public:
  /// Makes it inactive, and sensitive to touch the next time. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// 0: touches answer nothing until it is called with another value, or the dialog was hidden.
  void lcdOn(int on) override;
  void onHover(event_data* event) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;

  using Widget::onPressKey;
  using Widget::onReleaseKey;
  void onBtn1Pressed(mouse_event mouse);
  void onBtn2Pressed(mouse_event mouse);
  void onBtn1Released(mouse_event mouse);
  void onBtn2Released(mouse_event mouse);
  void onPressKey(kbd_event key);
  void onReleaseKey(kbd_event key);

 protected:
  /// `logWord` speaks in the log and is a literal. The dialog is not registered yet.
  explicit FramedDialog(const char* logWord);

  /// As constructed: no callback of those above, sensitive to touch.
  void startOver();

  // What the touch handlers are made of, for a class whose touches mean more.

  /// True for an event of a code up to `last`, 2 at most, when another finger holds the dialog.
  bool isHeldByOther(const event_data& event, EventCode last) const;
  /// Takes the highlight from the buttons that the finger is not on. False: no finger holds one.
  bool leaveButtons(const event_data* event);
  /// Tells of the press, and presses the button under the finger. Null: there was none.
  const DialogButton* pressAt(event_data* event);
  /// Takes the highlight away. True: the finger lifted on the button, which is to answer.
  bool liftFrom(DialogButton& button, const event_data* event);

  const char* word;
  // Guarded by stateLock, as far as it is not said otherwise.
  DialogFrame frame;
  DialogButton button1;
  DialogButton button2;
  unsigned int btnNormalColor = kColorWhite;
  std::atomic<int> lcdOnFlag = 1;

 private:
  bool hoverAt(event_data* event);
  bool releaseAt(event_data* event);
  void pressButton(DialogButton& button, const mouse_event& mouse);
  bool isOn(const DialogButton& button, const event_data* event) const;
  void restoreFace(DialogButton& button);
};

}  // namespace MW
