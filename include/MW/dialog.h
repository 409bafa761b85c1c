/// The built-in prompts.
#pragma once

#include <MW/detail/key_clicks.h>
#include <MW/prompt_dialog.h>

namespace MW {

/// A modal prompt whose number alone says what it asks, how it looks and which buttons it has: the
/// table of kinds stands in dialog_catalogue.cpp. A kind that is not in the table is an empty
/// dialog of two buttons.
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
