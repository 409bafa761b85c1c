/// Raw input for screens that test keys, the touch panel and plugs.
#pragma once

#include <MW/detail/key_clicks.h>
#include <MW/widget.h>

namespace MW {

/// Draws nothing, and tells the application about keys, touches, long presses and plugs.
///
/// It enters the base layer when it is constructed, active, and stays there until it is deleted or
/// unregistered. Keys, long presses, user and application events are taken; touch press, release
/// and motion go on to the other widgets.
///
/// It may be offered events before the application has set its callbacks, and while it sets them: a
/// callback word may be assigned on any thread, and an event finds either the old function or the
/// new one. An event that arrives before its callback is set is lost.
///
/// Callbacks. Of one kbd_event*: `keyPressCallback`; `keyReleaseCallback`; `doubleKeyCallback` and
/// `tripleKeyCallback`, the second and the third release of one key, each within 1000 ms of the one
/// before; `plugCallback`. Of one mouse_event*: `touchPressCallback`,
/// `touchReleaseCallback`, `longPressCallback`. The record is valid for the call. They are called
/// on the dispatch thread, and a plug event that was held back on the thread that draws.
///
/// Plug events (user events) of a PlugCode are held back for 100 ms, so that a plug that bounces is
/// told once it has settled: the passing ones are then told as kPlugSettled. Another code is told
/// at once if the last PlugCode was kPlugSettled or was told as it; a kPlugSettled that is still
/// held is then dropped. Before the first PlugCode, and while a passing one is held, another code
/// is dropped. Nothing is held while `plugCallback` is null.
class MW_API Key : public Widget {
 public:
  /// Codes of user events that tell of a plug.
  enum PlugCode { kPlugSettled = 2, kPlugPassing1 = 17, kPlugPassing2 = 18 };

  Key();
  ~Key() override;

  /// show(0).
  int show() override;
  /// Delivers the plug event that is due. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPlugKey(kbd_event key) override;
  void onPressTouch(mouse_event mouse) override;
  void onReleaseTouch(mouse_event mouse) override;

  using Widget::onPressKey;
  using Widget::onPressLong;
  using Widget::onReleaseKey;

  // Parts of onRecvEvent(); see Widget::onHover().

  void onPressKey(kbd_event key);
  void onReleaseKey(kbd_event key);
  void onPressLong(mouse_event mouse);
  /// Counts a release of the key that was released last. Any other key ends the count.
  void onKeyClickCount(kbd_event key);

 protected:
  KeyClicks keyClicks;  // dispatch thread
  // Guarded by stateLock.
  kbd_event plugEvent = {};  // the last PlugCode, held back or told
  bool plugHeld = false;     // it is held back
  unsigned int plugDue = 0;  // until then: GetTicks() milliseconds
};

}  // namespace MW
