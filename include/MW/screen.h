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
/// `doubleClickCallback`, a function of one int that is called with 0: the second of two taps, each
/// released inside the square of 50 x 50 pixels around its press, the first within 500 ms of its
/// press, the second within 500 ms of the first. A tap that starts less than 50 pixels from an edge
/// of the screen does not count.
///
/// With kPassOn in its variant it reports its events and passes them on. While a finger holds it,
/// each event then reaches it twice, once as a selected widget and once as an active one: it
/// reports both, and one tap can be a double tap.
class MW_API Screen : public Widget {
 public:
  /// A bit of the variant, which setButtonType() sets.
  enum VariantBit { kPassOn = 2 };
  /// setRect's modes.
  enum SquareMode { kSquare = 0, kNoSquare = 1 };

  Screen();
  ~Screen() override;

  /// Draws nothing. Returns 1.
  int show() override;
  int show(unsigned int ticks) override;
  /// Makes it inactive. A finger that holds it is followed, and reported, until it lifts. Returns
  /// 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onHover(event_data* event) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  void onPressLong(event_data* event) override;
  /// Centres the square in which a tap must end on (`center->x`, `center->y`). With kNoSquare, or
  /// less than 50 pixels from an edge of the screen, there is no square. Null: no change.
  void setRect(int mode, const SKIA_Rect* center) override;
  void onTouchClickCount() override;

 protected:
  int screenW = 0;  // pixels
  int screenH = 0;  // pixels
  // `rect`, the square, is guarded by stateLock.
  DoubleTap clicks;  // dispatch thread
};

/// Fills the screen with one colour, to look for faults of the display.
///
/// It enters the top layer when it is constructed, inactive, and stays there until it is deleted or
/// unregistered. While it is active it ignores all events, yet none reaches the base layer. End it
/// from another widget of the top layer, or without input, by a timer.
class MW_API FullScreen : public Widget {
 public:
  /// What it is filled with; any other number is grey as well.
  enum Fill { kWhite = 0, kRed = 1, kGreen = 2, kBlue = 3, kGrey = 4 };

  /// `color`: a Fill.
  explicit FullScreen(int color);
  ~FullScreen() override;

  /// One box, a pixel wider and higher than the screen. Returns 1.
  int show() override;
  int show(unsigned int ticks) override;
  /// Makes it inactive, and remembers the panel as on. Returns 1.
  int hide() override;
  /// Remembers whether the panel is on, for a derived class. It looks the same either way.
  void lcdOn(int on) override;
  using Widget::setRect;
  /// Fills the present screen with the colour of that number.
  void setRect(int color);

 protected:
  int colorIndex;                 // as constructed
  int screenW = 0;                // pixels; guarded by stateLock
  int screenH = 0;                // pixels; guarded by stateLock
  SKIA_Rect fillRect = {};        // guarded by stateLock
  std::atomic<int> lcdState = 1;  // 1: the panel is on
};

}  // namespace MW
