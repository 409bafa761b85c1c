/// The built-in prompts.
#pragma once

#include <MW/detail/dialog_frame.h>
#include <MW/detail/key_clicks.h>
#include <MW/detail/star_row.h>
#include <MW/widget.h>

namespace MW {

/// A modal prompt whose number alone says what it asks, how it looks and which buttons it has: the
/// table of kinds stands in dialog_catalogue.cpp. A kind that is not in the table is an empty
/// dialog of two buttons.
///
/// It enters the top layer when it is constructed, inactive, and leaves it when it is deleted.
/// While it is active nothing below gets events. Handlers run on the dispatch thread.
///
/// The answer comes by callback. Of one int, called with 0: `button1Callback` (left; the dialog
/// stays), `button2Callback` (right; the dialog has hidden itself before) and `hookKeyCallback`
/// (the hook key, of kind 13 alone). Of one mouse_event*: `pressCallback`, `hoverCallback`,
/// `clickCallback` (any touch, any place, the last one at its release). Of one kbd_event*:
/// `keyPressCallback`, `keyReleaseCallback`, `plugCallback`, and `doubleKeyCallback` and
/// `tripleKeyCallback`: the second and third release of one key of which each comes within 1000 ms
/// of the one before. Records are valid for the call.
class MW_API Dialog : public Widget {
 public:
  explicit Dialog(int dialogKind);
  ~Dialog() override;

  using Widget::show;
  /// Draws it. A kind with a progress row lets it grow. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive, and sensitive to touch the next time. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// 0: touches answer nothing until it is called with another value, or the dialog was hidden.
  void lcdOn(int on) override;
  void onHover(event_data* event) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPlugKey(kbd_event key) override;

  using Widget::onPressKey;
  using Widget::onReleaseKey;
  using Widget::setDesc;
  using Widget::setRect;
  /// The number of the layout class of a kind, 0 to 7.
  static int isType(int dialogKind);
  /// Lays it out on the present screen as `dialogKind`; its texts stay.
  void setRect(int dialogKind);
  /// Replace the title, and the message, by a text of at most 127 bytes. Null is the empty text.
  void setTitle(const char* newTitle);
  void setDesc(const char* newMessage);
  void onBtn1Pressed(mouse_event mouse);
  void onBtn2Pressed(mouse_event mouse);
  void onBtn1Released(mouse_event mouse);
  void onBtn2Released(mouse_event mouse);
  void onPressKey(kbd_event key);
  void onReleaseKey(kbd_event key);
  void onHookKeyPressed();
  /// Counts a release of the key that was released last; any other key ends the count.
  void onKeyClickCount(kbd_event key);
  /// Draws the progress row in the place of button 1.
  void updateProgress(unsigned int ticks);

 protected:
  int kind;
  // Guarded by stateLock, as far as it is not said otherwise.
  DialogFrame frame;
  SKIA_Rect messageRect = {};
  SKIA_Text message = {};
  SKIA_Rect secondRect = {};
  SKIA_Text second = {};
  DialogButton button1;
  DialogButton button2;
  StarRow progress;  // a released key delays it, too: meant so
  unsigned int btnNormalColor = kColorWhite;
  int screenW = 0;  // pixels
  int screenH = 0;
  std::atomic<int> lcdOnFlag = 1;
  KeyClicks keyClicks;  // dispatch thread

 private:
  void fillIn();
  bool pressAt(event_data* event);
  bool hoverAt(event_data* event);
  void releaseAt(event_data* event);
  void pressButton(DialogButton& button, const mouse_event& mouse);
  bool isOn(const DialogButton& button, const event_data* event) const;
  void restoreFace(DialogButton& button);
  void drawProgress(unsigned int ticks);
};

}  // namespace MW
