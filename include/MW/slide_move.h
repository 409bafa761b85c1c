/// The value slider.
#pragma once

#include <MW/detail/knob_hold.h>
#include <MW/widget.h>

namespace MW {

/// A bar whose knob a finger drags to choose a number; what lies left of the knob is red. It has no
/// callbacks: the application asks getValue().
///
/// It is a control for percentages: a knob position worth 99.9 or more gives the value 100,
/// whatever the range. Give it no maximum above 100.
///
/// It enters the base layer when it is constructed, inactive, and stays there until it is deleted
/// or unregistered; setActive() alone shows and hides it. A finger that presses the knob drags it.
/// When the finger lifts, or any finger presses elsewhere, the knob stays where it is. Handlers run
/// on the dispatch thread; any thread may call getValue() and setValue().
class MW_API SlideMove : public Widget {
 public:
  /// As a knob's width: 20 per cent, with the value written on the knob.
  enum KnobWidth { kValueKnob = 0 };

  /// Copies `area`; null is all zero. `percent`: the knob's width in hundredths of the bar's, at
  /// most 50, or kValueKnob. `a` and `b` bound the value, in either order; equal ones stand for 0
  /// to 1. The value starts at `b` if `initial` is `b` or more, else at `a` if it is `a` or less,
  /// else at `initial`. Give two different bounds, the lower one first, or the knob may start off
  /// the bar.
  SlideMove(const SKIA_Rect* area, int percent, int a, int b, int initial);
  ~SlideMove() override;

  /// show(0).
  int show() override;
  /// Draws it. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  void onPress(event_data* event) override;
  void onRelease(event_data* event) override;
  /// Set `locked`, which only a derived class reads: a locked slider can still be dragged.
  void Lock() override;
  void unLock() override;

  using Widget::onHover;
  using Widget::setRect;
  /// Drags the knob by the event's relative motion.
  void onHover(mouse_event mouse);
  /// Lays it out in `area`, its knob where the value says. Null: no change.
  void setRect(const SKIA_Rect* area);
  /// Lays the fill out up to that rectangle's left edge, and the knob's frame there. It draws
  /// nothing, and the next drawing pass lays both out by the knob again. Null: no change.
  void setRect_Slide(const SKIA_Rect* knob);
  /// The value that the knob shows.
  int getValue() const;
  /// Sets the value without clamping it (read as an int) and moves the knob there: off the bar if
  /// out of range, to its left end if the knob has no room to move.
  void setValue(unsigned int newValue);
  /// Sets the value that belongs to the knob's distance from the bar's left end, in pixels. The
  /// value stays while the bar leaves the knob no room to move.
  void setMove2Value(unsigned int position);
  /// The distance that belongs to a value, read as an int; 0 while there is no room to move, and
  /// cut to the range of an int.
  int setValue2Move(unsigned int ofValue);

 protected:
  std::atomic<int> locked = 0;           // 1: locked
  KnobHold knobHold{hold, ownerFinger};  // dispatch thread
  // These four never change after construction.
  int minValue;
  int maxValue;
  int knobPercent;
  int showValue;  // 1: the value stands on the knob
  // The rest, and `rect`, the knob, is guarded by stateLock.
  int value;
  int travel = 0;  // pixels that the knob can move
  SKIA_Rect track = {};
  SKIA_Rect groove = {};
  SKIA_Rect fill = {};
  SKIA_Rect frameInner = {};
  SKIA_Rect frameOuter = {};
  SKIA_Text valueText = {};

 private:
  void layOut(const SKIA_Rect& area);
  void fillUpTo(int32_t knobX);
  int distanceOf(int ofValue) const;
  void takeValueAt(unsigned int position);
};

}  // namespace MW
