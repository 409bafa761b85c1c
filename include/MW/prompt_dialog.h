/// What the dialogs that ask something have in common.
#pragma once

#include <MW/detail/star_row.h>
#include <MW/framed_dialog.h>

namespace MW {

/// A dialog that may have a growing row of asterisks in the place of its buttons, and that knows
/// the hook key and the plug. Dialog has built-in texts, DialogNew takes any; this class is not
/// used by itself.
///
/// Callbacks besides FramedDialog's: `hookKeyCallback`, of one int, called with 0, where the hook
/// key answers; elsewhere the press of that key is ignored. `plugCallback`, of one kbd_event*.
class MW_API PromptDialog : public FramedDialog {
 public:
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPlugKey(kbd_event key) override;

  /// A part of onRecvEvent(): the hook key answers.
  void onHookKeyPressed();
  /// Draws the progress row in the place of button 1, whether the dialog is active or not: one to
  /// ten asterisks, one more every 100 ms. `ticks`: GetTicks() milliseconds. show() calls it where
  /// there is such a row.
  void updateProgress(unsigned int ticks);

 protected:
  /// The mode in which the hook key answers.
  static constexpr int kHookMode = 13;

  /// See FramedDialog.
  explicit PromptDialog(const char* logWord);

  /// A key's press. The hook key answers if `mode` is kHookMode.
  void pressKey(const kbd_event& key, int mode);
  /// As updateProgress(). Call it under stateLock.
  void drawProgress(unsigned int ticks);

  StarRow progress;  // guarded by stateLock
};

}  // namespace MW
