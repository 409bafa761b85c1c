/// What the dialogs with buttons have in common.
#pragma once

#include <MW/detail/dialog_frame.h>
#include <MW/widget.h>

namespace MW {

/// A frame in the middle of the screen: a title, a body, and below it up to two buttons. The
/// classes derived from it say what stands in the body; this class is not used by itself.
///
/// The application owns the dialog. A dialog enters the top layer, inactive, when it is constructed
/// and leaves it when it is deleted; setActive(1) brings it up. While it is active, the widgets
/// underneath get no events. The application's thread draws it; show() without ticks draws nothing.
/// onRecvEvent(), the one entry for events, runs on the dispatch thread and calls the handlers
/// declared below and the callbacks; a callback may delete the dialog. A null event is not taken.
///
/// A button turns kColorHighlight when a finger presses it, and turns back when a finger moves
/// outside it or lifts. It answers every finger that lifts on it, wherever that finger came from.
/// The dialog takes the press of a button, all motion after that until it is hidden, and every
/// release. DialogList and DialogShell follow one finger and say which touches they take.
///
/// Callbacks, null where they are not wanted:
/// - of one int, called with 0: `button1Callback` (the left button; the dialog stays up until the
///   application hides it) and `button2Callback` (the right one; the dialog has hidden itself).
/// - of one mouse_event*: `pressCallback`, `hoverCallback` and `clickCallback` get every press,
///   motion and release, at any place; clickCallback comes after the buttons' callbacks.
/// - of one kbd_event*: `keyPressCallback`, `keyReleaseCallback`.
/// Records are copies, valid for the call.
class MW_API FramedDialog : public Widget {
 public:
  /// Makes it inactive, and sensitive to touch the next time. Returns 1. Any thread.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// 0: touches press no button, and no button answers or turns back when a finger lifts, until it
  /// is called with another value or the dialog is hidden. Motion still turns a button back, except
  /// in a DialogList. Any thread.
  void lcdOn(int on) override;
  void onHover(event_data* event) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;

  using Widget::onPressKey;
  using Widget::onReleaseKey;

  // Parts of onRecvEvent(); see Widget::onHover().

  void onBtn1Pressed(mouse_event mouse);
  void onBtn2Pressed(mouse_event mouse);
  void onBtn1Released(mouse_event mouse);
  void onBtn2Released(mouse_event mouse);
  void onPressKey(kbd_event key);
  void onReleaseKey(kbd_event key);

 protected:
  /// What a button does when a finger lifts on it.
  using Answer = void (FramedDialog::*)(mouse_event);

  /// `logWord` stands in each log line; it must outlive the dialog. The derived class registers it.
  explicit FramedDialog(const char* logWord);

  /// As constructed: none of the callbacks above, sensitive to touch.
  void startOver();

  // What the touch handlers are made of, for a class whose touches mean more.

  /// Calls onPress(), and presses the button under the finger. Null: there is none, touches are
  /// ignored, or the dialog is gone.
  const DialogButton* pressAt(event_data* event);
  /// Takes the highlights away, and lets the button under the finger answer. False: the dialog is
  /// gone.
  bool releaseButtons(const event_data* event);

  const char* word;
  Answer answer1 = &FramedDialog::onBtn1Released;
  Answer answer2 = &FramedDialog::onBtn2Released;
  // Whether motion is taken and turns buttons back even after lcdOn(0).
  bool followsMotionInTheDark = true;
  // Guarded by stateLock, except for lcdOnFlag.
  DialogFrame frame;
  DialogButton button1;
  DialogButton button2;
  unsigned int btnNormalColor = kColorWhite;
  std::atomic<int> lcdOnFlag = 1;

 private:
  bool hoverAt(event_data* event);
  bool releaseAt(event_data* event);
  bool liftFrom(DialogButton& button, const event_data* event);
  void pressButton(DialogButton& button, const mouse_event& mouse);
  bool isOn(const DialogButton& button, const event_data* event) const;
  void restoreFace(DialogButton& button);
};

}  // namespace MW
