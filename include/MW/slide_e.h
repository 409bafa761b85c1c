/// The slide-to-exit control.
#pragma once

#include <MW/detail/knob_hold.h>
#include <MW/widget.h>

#include <cstddef>

namespace MW {

/// A bar with a square knob marked "EXIT" at one end and a caption beside it. Dragging the knob
/// all the way to the other end asks to exit.
///
/// It enters the base layer when it is constructed, inactive, and stays there until it is deleted
/// or unregistered; setActive() alone shows and hides it. A finger that presses the knob drags it.
/// The knob snaps back when the finger lifts before the end, and when any finger presses elsewhere.
/// Handlers run on the dispatch thread.
///
/// Callback: `exitCallback`, a function of one int that is called with 0. The finger no longer
/// holds the knob then, and the next drawing pass puts the knob back.
class MW_API SlideE : public Widget {
 public:
  /// Where the knob starts; it exits at the other end. 2 and 4 are kFromLeft as well, 3 and 5
  /// kFromRight. Any other starts at the right and never exits.
  enum State { kFromLeft = 0, kFromRight = 1 };

  /// Copies the records; the bar has `area`'s colour. The last argument is not read, and may be
  /// null. Null records are all zero or empty.
  SlideE(int startState, const SKIA_Rect* area, const SKIA_Text* caption, const char* unused);
  SlideE(int startState, const SKIA_Rect* area, const SKIA_Text* caption, const SKIA_Text* unused);
  SlideE(int startState, const SKIA_Rect* area, const SKIA_Text* caption, std::nullptr_t unused);
  ~SlideE() override;

  /// show(0).
  int show() override;
  /// Draws it, its knob at home while no finger holds it. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// Lays it out in `area`, its knob where `newState` says until the next drawing pass puts it
  /// where `state` says. Null: no change.
  void setRect(int newState, const SKIA_Rect* area) override;

  using Widget::onHover;
  using Widget::onPress;
  using Widget::onRelease;
  /// Parts of onRecvEvent(); see Widget::onHover().
  void onPress(mouse_event mouse);
  void onRelease(mouse_event mouse);
  /// Drags the knob by the event's relative motion.
  void onHover(mouse_event mouse);
  /// Already called by the constructors. Calling it again lays it out anew, inactive and without
  /// slide callbacks, and registers it a second time.
  void SlideE_init(int startState, const SKIA_Rect* area, const SKIA_Text* caption,
                   const char* unused);

  /// A State. Dragging does not change it. Set it before the slide becomes active; later, only
  /// through std::atomic_ref.
  int state;

 protected:
  KnobHold knobHold{hold, ownerFinger};  // dispatch thread
  // The rest, `rect`, the knob, and `point`, its arrow, is guarded by stateLock.
  int unit = 0;  // pixels, the knob's side
  SKIA_Rect track = {};
  SKIA_Rect labelRect1 = {};
  SKIA_Text caption1 = {};  // beside the knob
  SKIA_Text caption2 = {};  // on the knob

 private:
  bool drag(int by);
  void snapKnob();
};

}  // namespace MW
