/// One finger's hold of a knob that it drags along a track.
#pragma once

#include <MW/event_service.h>
#include <MW/records.h>

#include <atomic>

namespace MW {

/// Says what an event means for a knob. The finger that presses the knob holds it until it lifts,
/// or until a press beside the knob, of any finger, cancels the hold. Stands on the widget's own
/// selection and owner finger, which the window's routing reads as well.
class KnobHold {
 public:
  enum class Touch { NotMine, Grab, Cancel, Move, Drop };

  KnobHold(std::atomic<int>& heldBy, std::atomic<int>& ownedBy)
      : selection(heldBy), ownerFinger(ownedBy) {}

  /// A cancelled hold has ended when this returns; what else follows is the widget's to do.
  Touch touch(const event_data& event, const SKIA_Rect& knob) {
    if (event.type == kEventPress) return press(event, knob);
    if (event.type != kEventMotion && event.type != kEventRelease) return Touch::NotMine;
    if (!isHeld() || static_cast<int>(event.mouse.finger) != ownerFinger) return Touch::NotMine;
    return event.type == kEventMotion ? Touch::Move : Touch::Drop;
  }
  bool isHeld() const { return selection != 0; }
  void grab(const mouse_event& mouse) {
    selection = static_cast<int>(mouse.finger + 1);
    ownerFinger = static_cast<int>(mouse.finger);
  }
  void letGo() {
    constexpr int kNoFinger = -1;
    selection = 0;
    ownerFinger = kNoFinger;
  }

 private:
  Touch press(const event_data& event, const SKIA_Rect& knob) {
    if (EventService::isMouseEventForMe(&knob, &event)) return Touch::Grab;
    if (!isHeld()) return Touch::NotMine;
    letGo();
    return Touch::Cancel;
  }

  std::atomic<int>& selection;
  std::atomic<int>& ownerFinger;
};

}  // namespace MW
