/// One finger's hold of a knob that it drags along a track.
#pragma once

#include <MW/api.h>
#include <MW/detail/finger_hold.h>
#include <MW/records.h>

#include <atomic>

namespace MW {

/// Says what an event means for a knob. The finger that presses the knob holds it until it lifts,
/// or until a press beside the knob, of any finger, cancels the hold. A finger that presses a held
/// knob takes it over. Uses the widget's `hold` and `ownerFinger` (-1: free). Call it on the thread
/// that handles events.
class MW_API KnobHold {
 public:
  enum class Touch { NotMine, Grab, Cancel, Move, Drop };

  KnobHold(FingerHold& widgetHold, std::atomic<int>& ownerWord)
      : hold(widgetHold), ownerFinger(ownerWord) {}

  /// A cancelled hold has ended when this returns; what else follows is the widget's to do.
  Touch touch(const event_data& event, const SKIA_Rect& knob);
  void grab(const mouse_event& mouse);
  void letGo();

 private:
  Touch press(const event_data& event, const SKIA_Rect& knob);

  FingerHold& hold;
  std::atomic<int>& ownerFinger;
};

}  // namespace MW
