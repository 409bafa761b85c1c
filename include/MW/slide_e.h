/// The slide-to-exit control.
#pragma once

#include <MW/detail/knob_hold.h>
#include <MW/widget.h>

namespace MW {

/// A bar with a square knob marked "EXIT" at one end and a caption beside it. Dragging the knob to
/// the very other end asks to exit.
///
/// It enters the base layer when it is constructed, inactive, and stays there until it is deleted
/// or unregistered; setActive() alone shows and hides it. A finger that presses the knob drags it;
/// a finger that lifts before the end, or another that presses elsewhere, lets the knob snap back.
/// Handlers run on the dispatch thread.
///
/// `state` 0, 2 or 4: the knob starts at the left and exits at the right; 1, 3 or 5: the other way
/// round. Any other starts at the right and never exits. Dragging does not change it.
///
/// Callback: `exitCallback`, a function of one int that is called with 0; the knob has been let go
/// before, and goes home with the next drawing pass.
class MW_API SlideE : public Widget {
 public:
  /// Copies the records; the bar has `area`'s colour. The last argument is not read. Null records
  /// are all zero or empty.
  SlideE(int startState, const SKIA_Rect* area, const SKIA_Text* caption, const char* unused);
  SlideE(int startState, const SKIA_Rect* area, const SKIA_Text* caption, const SKIA_Text* unused);
  ~SlideE() override;

  using Widget::show;
  /// Draws it, its knob at home while no finger holds it. Returns 1.
  int show(unsigned int ticks) override;
  bool onRecvEvent(event_data* event, unsigned int arg) override;
  /// Lays it out in `area`, its knob where `newState` says; `state` stays. Null: nothing.
  void setRect(int newState, const SKIA_Rect* area) override;

  using Widget::onHover;
  using Widget::onPress;
  using Widget::onRelease;
  void onPress(mouse_event mouse);
  void onRelease(mouse_event mouse);
  /// Drags the knob by the event's relative motion.
  void onHover(mouse_event mouse);
  /// What the constructors do: lays it out inactive, clears the slide callbacks, and registers it.
  void SlideE_init(int startState, const SKIA_Rect* area, const SKIA_Text* caption,
                   const char* unused);

  std::atomic<int> state;  ///< see above

 protected:
  KnobHold hold{select, ownerFinger};
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
