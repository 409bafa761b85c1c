/// Widgets as large as the screen.
#pragma once

#include <MW/detail/double_tap.h>
#include <MW/widget.h>

namespace MW {

/// Catches every touch, wherever it is, and draws nothing.
///
/// It enters the base layer when it is constructed, inactive, and stays there until it is deleted
/// or unregistered. Handlers run on the dispatch thread.
///
/// Callbacks: `pressCallback`, `hoverCallback`, `longPressCallback` and `clickCallback` (a release,
/// wherever it is), each a function of one mouse_event* that is valid for the call; and
/// `doubleClickCallback`, a function of one int that is called with 0: the second of two taps of
/// which each is released within 25 pixels of where it was pressed, and each step takes under
/// 500 ms. A tap that starts less than 50 pixels from an edge of the screen does not count.
///
/// With bit 2 set in its variant (`setButtonType(2)`) it reports events and passes them on. While a
/// finger holds it, it is then offered, and reports, each event twice: once as a selected widget
/// and once as an active one.
class MW_API Screen : public Widget {
 public:
  Screen();
  ~Screen() override;

  /// Draws nothing. Returns 1.
  int show() override;
  int show(unsigned int ticks) override;
  /// Makes it inactive. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onHover(event_data* event) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPressLong(event_data* event) override;
  /// Puts the square in which a tap must end around the point at `center`'s corner; with `mode` 1,
  /// and near an edge, there is none. Null: nothing.
  void setRect(int mode, const SKIA_Rect* center) override;
  void onTouchClickCount() override;

 protected:
  int screenW = 0;  // pixels
  int screenH = 0;
  DoubleTap clicks;  // dispatch thread, and so is `rect`, the square
};

/// Fills the screen with one colour, to look for faults of the display.
///
/// It enters the top layer when it is constructed, inactive, and stays there until it is deleted or
/// unregistered.
class MW_API FullScreen : public Widget {
 public:
  /// 0 white, 1 red, 2 green, 3 blue, any other grey.
  explicit FullScreen(int color);
  ~FullScreen() override;

  /// One box, a pixel wider and higher than the screen. Returns 1.
  int show() override;
  int show(unsigned int ticks) override;
  /// Makes it inactive and the panel on. Returns 1.
  int hide() override;
  /// Keeps whether the panel is on; nothing else follows from it here.
  void lcdOn(int on) override;
  using Widget::setRect;
  /// Fills the present screen with the colour of that number.
  void setRect(int color);

 protected:
  int colorIndex;
  int screenW = 0;  // pixels
  int screenH = 0;
  SKIA_Rect fillRect = {};        // guarded by stateLock
  std::atomic<int> lcdState = 1;  // 1: the panel is on
};

}  // namespace MW
