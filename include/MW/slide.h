/// Slide switches.
#pragma once

#include <MW/detail/double_tap.h>
#include <MW/detail/knob_hold.h>
#include <MW/widget.h>

namespace MW {

/// A switch of two positions: a knob of two units' width on a track of five, with the legends "ON"
/// at the left and "OFF" at the right.
///
/// It enters the base layer when it is constructed, inactive, and stays there until it is deleted
/// or unregistered. A finger that presses the knob drags it; at the other end, or near it, the
/// switch changes and lets go of the finger. A finger that lifts before, or another finger that
/// presses elsewhere, lets the knob snap back. Handlers run on the dispatch thread.
///
/// `state`: 0 left and 1 right, of a switch that changes when the knob reaches the far end; 2 left
/// and 3 right, of one that changes when it comes within a unit of it. Any other stands at the left
/// and cannot be changed by dragging.
///
/// Callbacks: `leftCallback` and `rightCallback`, functions of one int that are called with 0 after
/// the change; `doubleClickCallback` (the double tap), a function of one mouse_event* whose `state`
/// is 1: two taps on the knob of a locked switch, each step under 500 ms. A locked switch shows its
/// knob alone, dimmed, and does not move.
class MW_API Slide : public Widget {
 public:
  /// Copies the records; `area`'s colour is not read. `second` may be null; otherwise both captions
  /// stand on the knob, one above the other. The second one has its record's `string_len`, 0 to
  /// 127, and of its text as many bytes as its `size` says; behind them stand NULs.
  Slide(int startState, const SKIA_Rect* area, const SKIA_Text* first, const SKIA_Text* second);
  ~Slide() override;

  /// show(0).
  int show() override;
  /// Draws the switch, its knob in its place while no finger holds it. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  /// Lays the switch out in `area`, its knob where `newState` says; `state` stays. Null: nothing.
  void setRect(int newState, const SKIA_Rect* area) override;
  void Lock() override;
  void unLock() override;

  using Widget::onHover;
  using Widget::onTouchClickCount;
  /// Drags the knob by the event's relative motion.
  void onHover(mouse_event mouse);
  void onTouchClickCount(mouse_event mouse);

  std::atomic<int> state;  ///< see above; changed on the dispatch thread

 protected:
  /// What the two classes of switches differ in.
  enum class Look { Legends, Plain };
  Slide(Look switchLook, int startState, const SKIA_Rect* area, const SKIA_Text* first,
        const SKIA_Text* second);

  Look look;
  std::atomic<int> locked = 0;
  KnobHold hold{select, ownerFinger};
  DoubleTap clicks;  // dispatch thread
  int captionCount;  // 1 or 2
  // The rest, and `rect`, the knob, is guarded by stateLock.
  int unit = 0;  // pixels, a fifth of the width
  SKIA_Rect track = {};
  SKIA_Rect leftSlot = {};
  SKIA_Rect rightSlot = {};
  SKIA_Rect lockRect = {};
  SKIA_Text caption1 = {};
  SKIA_Text caption2 = {};
  SKIA_Rect labelRect1 = {};
  SKIA_Rect labelRect2 = {};

 private:
  enum class Change { None, ToLeft, ToRight };

  bool isOnKnob(const event_data* event) const;
  void snapKnob();
  Change drag(int by);
  void drawTrack() const;
};

/// The same without legends, and with a knob that covers the whole area at the left.
class MW_API SlideV : public Slide {
 public:
  SlideV(int startState, const SKIA_Rect* area, const SKIA_Text* first, const SKIA_Text* second);
  ~SlideV() override;
};

}  // namespace MW
