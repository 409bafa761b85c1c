/// Where the touches of a knob go.
#pragma once

#include <MW/detail/knob_hold.h>
#include <MW/records.h>

namespace MW {

/// Passes what an event means for the knob to the slider's operation. False: it means nothing.
template <typename Slider>
bool routeKnobTouch(Slider& slider, KnobHold::Touch touch, event_data* event) {
  switch (touch) {
    case KnobHold::Touch::NotMine: return false;
    case KnobHold::Touch::Grab: slider.onPress(event); return true;
    case KnobHold::Touch::Cancel: return true;
    case KnobHold::Touch::Move: slider.onHover(event->mouse); return true;
    case KnobHold::Touch::Drop: break;
  }
  slider.onRelease(event);
  return true;
}

}  // namespace MW
