/// What the dialogs that ask something have in common.
#pragma once

#include <MW/detail/star_row.h>
#include <MW/framed_dialog.h>

namespace MW {

/// A dialog that may have a growing row of asterisks in the place of its buttons, and that knows
/// the hook key and the plug. Dialog has built-in texts, DialogNew any; this class is not used by
/// itself.
///
/// Callbacks besides FramedDialog's: `hookKeyCallback`, of one int, called with 0, where the hook
/// key answers; other dialogs ignore that key's press. `plugCallback`, of one kbd_event*.
class MW_API PromptDialog : public FramedDialog {
 public:
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPlugKey(kbd_event key) override;

  using Widget::onPressKey;
  void onPressKey(kbd_event key);
  void onHookKeyPressed();
  /// Draws the progress row in the place of button 1, be the dialog active or not: one to ten
  /// asterisks, one more every 100 ms. `ticks`: GetTicks() milliseconds.
  void updateProgress(unsigned int ticks);

 protected:
  explicit PromptDialog(const char* logWord);

  void drawProgress(unsigned int ticks);  // under stateLock

  bool answersHookKey = false;
  StarRow progress;  // guarded by stateLock
};

}  // namespace MW
