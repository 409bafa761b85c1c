#include "lists/list_input.h"

#include <MW/event_service.h>

#include "core/geometry.h"

namespace MW {

bool takesTouch(const event_data& event, int holder, const SKIA_Rect& area, EventCode last,
                const ClassLog& log) {
  const bool isTouch = event.type >= kEventMotion && event.type <= last;
  if (isTouch && holder != 0 && holder != static_cast<int>(event.mouse.finger + 1)) {
    if (event.type != kEventMotion) {
      log.print(LogLevel::Debug, "onRecvEvent-> T:%d, F:%d", event.type,
                static_cast<int>(event.mouse.finger));
    }
    return false;
  }
  return holder != 0 || EventService::isMouseEventForMe(&area, &event);
}

void logKeyPress(const ClassLog& log, kbd_event key) {
  log.print(LogLevel::Debug, "key pressed sym = %d", static_cast<int>(key.code));
}

void logKeyRelease(const ClassLog& log, kbd_event key) {
  log.print(LogLevel::Debug, "key onReleaseKey sym = %d", static_cast<int>(key.code));
}

void logRow(const ClassLog& log, int64_t top, const mouse_event& mouse, int64_t bottom) {
  log.print(LogLevel::Debug, "position2index= %04d < %04d > %04d", toPixels(top), mouse.y,
            toPixels(bottom));
}

}  // namespace MW
