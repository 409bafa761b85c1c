#include <MW/detail/knob_hold.h>

#include "core/hit_test.h"

namespace MW {

KnobHold::Touch KnobHold::touch(const event_data& event, const SKIA_Rect& knob) {
  if (event.type == kEventPress) return press(event, knob);
  if (event.type != kEventMotion && event.type != kEventRelease) return Touch::NotMine;
  const bool isOwners = static_cast<int>(event.mouse.finger) == ownerFinger;
  if (!hold.isHeld() || !isOwners) return Touch::NotMine;
  return event.type == kEventMotion ? Touch::Move : Touch::Drop;
}

KnobHold::Touch KnobHold::press(const event_data& event, const SKIA_Rect& knob) {
  if (contains(knob, positionOf(event))) return Touch::Grab;
  if (!hold.isHeld()) return Touch::NotMine;
  letGo();
  return Touch::Cancel;
}

void KnobHold::grab(const mouse_event& mouse) {
  hold.press(mouse);
  ownerFinger = static_cast<int>(mouse.finger);
}

void KnobHold::letGo() {
  constexpr int kNoFinger = -1;
  hold.letGo();
  ownerFinger = kNoFinger;
}

}  // namespace MW
