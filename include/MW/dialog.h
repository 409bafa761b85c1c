/// The built-in prompts.
#pragma once

#include <MW/detail/key_clicks.h>
#include <MW/prompt_dialog.h>

namespace MW {

/// A modal prompt whose kind alone says what it asks, how it looks and which buttons it has.
///
/// Most kinds have two buttons; the left one agrees. "OK": one wide button, which is button 1. "No
/// button": the application hides it. "Stars": a progress row on a red screen, which takes touches
/// as button 1 does. A number without a name is an empty dialog of two buttons.
///
/// Callbacks are PromptDialog's and two more of one kbd_event*: `doubleKeyCallback` and
/// `tripleKeyCallback` get the second and the third release of the same key, each within 1000 ms
/// of the one before. Handlers run on the dispatch thread.
class MW_API Dialog : public PromptDialog {
 public:
  /// What it asks, in the words of the constant.
  enum Kind {
    kLeaveFailedTest = 0,
    kPassOrFail = 1,
    kRetryTest = 2,
    kLeaveTest = 3,
    kCalibrateSensor = 4,
    kRecalibrateSensor = 5,
    kBadGyroValue = 6,  ///< OK; its right half is button 2 as well, and answers after button 1
    kCalibrateGyro = 7,
    kRecalibrateGyro = 8,
    kCalibrateAPlus = 9,
    kRecalibrateAPlus = 10,
    kBadAPlusChecksum = 11,
    kFactoryReset = 12,
    kPushHookKey = 13,      ///< no button; the only kind that answers the hook key
    kReinsertEarjack = 14,  ///< no button
    kStartTouchTest = 15,   ///< OK
    kBootNormally = 16,
    kBootToTests = 17,
    kPowerOff = 18,
    kTwoKeysAtOnce = 19,  ///< OK
    kRepeatPassedTest = 20,
    kRepeatPassedTestAgain = 21,  ///< says "pass" where the kind before says "Pass"
    kDoNotTouch = 23,             ///< stars
    kCautionDoNotTouch = 24,      ///< stars; their right half is button 2 as well
    kFullRetry = 25,
    kWifiTest = 26,             ///< OK
    kSelfTestFailsOrRuns = 27,  ///< OK
    kAllButCapSensor = 28,      ///< OK
    kGpsTestRuns = 29,          ///< OK
    kSelfTestRuns = 30,         ///< OK
    kAllInOneFails = 31,        ///< OK
    kTouchFirmwareDone = 32,    ///< OK
    kSniffRetransmission = 33,
    kSniffUpdate = 34,
    kReconnect = 35,       ///< OK
    kSocketFails = 36,     ///< OK
    kStartVoiceTest = 37,  ///< OK
    kWaitVoiceTest = 38,   ///< no button
    kLeaveLightSensor = 39
  };

  /// How the kinds are laid out; a number without a name is kStandard.
  enum Layout {
    kStandard = 0,      ///< one line of message, two buttons
    kTwoLine = 1,       ///< two lines, two buttons
    kHook = 2,          ///< one line, no button; the hook key answers
    kEarjack = 3,       ///< two lines, no button
    kOkOnly = 4,        ///< one line, one wide button
    kTouchWarning = 5,  ///< one line and a progress row, on red
    kTouchCaution = 6,  ///< two lines and a progress row, on red
    kWait = 7           ///< one line, no button
  };

  /// `dialogKind`: a Kind or any other number.
  explicit Dialog(int dialogKind);
  ~Dialog() override;

  using Widget::show;
  /// Draws it, be it active or not; a progress row grows. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;

  using Widget::onPressKey;
  using Widget::onReleaseKey;
  using Widget::setDesc;
  using Widget::setRect;
  /// The Layout of a kind.
  static int isType(int dialogKind);
  /// Lays it out on the present screen as `dialogKind`, with that kind's letters. Its texts stay,
  /// and its kind: what is drawn of it, on red or not. Any thread.
  void setRect(int dialogKind);
  /// Replaces the title. At most 127 bytes are taken; null is the empty text. Any thread.
  void setTitle(const char* newTitle);
  /// Replaces the message, by the same rules.
  void setDesc(const char* newMessage);
  /// Parts of onRecvEvent(); see Widget::onHover().
  void onPressKey(kbd_event key);
  void onReleaseKey(kbd_event key);
  /// Counts a release of the key that was released last; any other key ends the count.
  void onKeyClickCount(kbd_event key);

 protected:
  int kind;  // as constructed
  // Guarded by stateLock.
  SKIA_Rect messageRect = {};
  SKIA_Text message = {};
  SKIA_Rect secondRect = {};
  SKIA_Text second = {};
  KeyClicks keyClicks;  // dispatch thread

 private:
  void fillIn();
};

}  // namespace MW
