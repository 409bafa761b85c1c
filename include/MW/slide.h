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
/// switch changes and lets go of the finger. The knob snaps back when the finger lifts before that,
/// and when any finger presses elsewhere. Handlers run on the dispatch thread.
///
/// Callbacks: `leftCallback` and `rightCallback`, functions of one int that are called with 0 once
/// `state` has changed; `doubleClickCallback` (the double tap), a function of one mouse_event* that
/// is valid for the call and whose `state` is 1: two taps on the knob of a locked switch, the first
/// released within 500 ms of its press, the second within 500 ms of the first. A locked switch
/// shows its knob alone, dimmed, and does not move.
class MW_API Slide : public Widget {
 public:
  /// A full-travel switch changes when the knob reaches the far end, a half-travel one when the
  /// knob comes within a unit of it. Any other state stands at the left, and dragging does not
  /// change it.
  enum State { kFullLeft = 0, kFullRight = 1, kHalfLeft = 2, kHalfRight = 3 };

  /// Copies the records; `area`'s colour is not read. A null area is all zero, a null first caption
  /// empty. With a second caption both stand on the knob, one above the other. The second one is
  /// cut to as many bytes as its `size` says, and filled up with NULs to its `string_len`: give it
  /// a size of at least its length.
  Slide(int startState, const SKIA_Rect* area, const SKIA_Text* first, const SKIA_Text* second);
  ~Slide() override;

  /// show(0).
  int show() override;
  /// Draws the switch, its knob in its place while no finger holds it. Returns 1.
  int show(unsigned int ticks) override;
  /// Makes it inactive. A finger that holds the knob is followed until it lifts: it can still
  /// change the switch. Returns 1.
  int hide() override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  /// Lays the switch out in `area`, its knob where `newState` says until the next drawing pass puts
  /// it where `state` says. Null: no change.
  void setRect(int newState, const SKIA_Rect* area) override;
  void Lock() override;
  void unLock() override;

  using Widget::onHover;
  using Widget::onTouchClickCount;
  /// Drags the knob by the event's relative motion.
  void onHover(mouse_event mouse);
  /// A part of onRecvEvent(): a tap on the knob ended, which may be the second of two.
  void onTouchClickCount(mouse_event mouse);

  /// A State. Dragging changes it on the dispatch thread, where a callback may read it plainly.
  /// Every write after setActive(1), and a read on another thread, goes through std::atomic_ref.
  int state;

 protected:
  /// What the two classes of switches differ in.
  enum class Look { Legends, Plain };
  /// As the public constructor.
  Slide(Look switchLook, int startState, const SKIA_Rect* area, const SKIA_Text* first,
        const SKIA_Text* second);

  Look look;                             // of the class
  std::atomic<int> locked = 0;           // 1: locked
  KnobHold knobHold{hold, ownerFinger};  // dispatch thread
  DoubleTap clicks;                      // dispatch thread
  int captionCount;                      // 1 or 2
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

  void snapKnob();
  Change drag(int by);
  void drawTrack() const;
};

/// The same without legends, and with a knob that covers the whole area at the left.
class MW_API SlideV : public Slide {
 public:
  /// As Slide.
  SlideV(int startState, const SKIA_Rect* area, const SKIA_Text* first, const SKIA_Text* second);
  ~SlideV() override;
};

}  // namespace MW
