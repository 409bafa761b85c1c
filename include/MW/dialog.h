/// The built-in prompts.
#pragma once

#include <MW/detail/key_clicks.h>
#include <MW/prompt_dialog.h>

namespace MW {

/// A modal prompt whose number alone says what it asks, how it looks and which buttons it has:
///
///   0 leave a failed test, 1 pass or fail, 2 test again, 3 leave a test; 4 calibrate the sensor,
///   5 again; 6 bad gyro value (OK), 7 calibrate the gyro, 8 again; 9 calibrate A+, 10 again,
///   11 after a bad checksum; 12 factory reset; 13 push the hook key (none); 14 reinsert the
///   earjack (none); 15 do not touch from now on (OK); 16 boot normally, 17 boot to all tests; 18
///   power off; 19 two keys at once (OK); 20, 21 repeat a passed test; 23, 24 do not touch (stars);
///   25 full retry; 26 WIFI (OK); 27 self-diagnosis fails or runs (OK), 30 runs (OK); 28 all tests
///   without CapSensor (OK); 29 GPS runs (OK); 31 AIO fails (OK); 32 touch firmware complete (OK);
///   33 sniff retransmission, 34 sniff update; 35 reconnect (OK); 36 socket fails (OK); 37 start of
///   the voice test (OK), 38 wait for its end (none); 39 leave the light sensor's error.
///
/// OK: one wide button, button 1. None: no button. Stars: a progress row on a red screen. The
/// others have two buttons, of which the left one agrees, and any other number is an empty dialog
/// of two buttons. Kinds 6 and 24 take touches for a second button that is not drawn, where the
/// right one of two stands, and kinds 23 and 24 on the progress row as for button 1.
///
/// The hook key answers for kind 13 alone. Callbacks besides PromptDialog's, of one kbd_event*:
/// `doubleKeyCallback` and `tripleKeyCallback`, the second and third release of one key of which
/// each comes within 1000 ms of the one before.
class MW_API Dialog : public PromptDialog {
 public:
  explicit Dialog(int dialogKind);
  ~Dialog() override;

  using Widget::show;
  /// Draws it. A kind with a progress row lets it grow. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;

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
  void onReleaseKey(kbd_event key);
  /// Counts a release of the key that was released last; any other key ends the count.
  void onKeyClickCount(kbd_event key);

 protected:
  int kind;
  SKIA_Rect messageRect = {};  // these four are guarded by stateLock
  SKIA_Text message = {};
  SKIA_Rect secondRect = {};
  SKIA_Text second = {};
  KeyClicks keyClicks;  // dispatch thread

 private:
  void fillIn();
};

}  // namespace MW
