/// What the lists make of input alike.
#pragma once

#include <MW/records.h>

#include <cstdint>

#include "core/class_log.h"

namespace MW {

/// Whether a pointer event is the list's: one in its area, or any while a finger holds it, which is
/// followed wherever it moves and keeps all others from the list. `holder`: that finger + 1, or 0.
/// `last`: codes up to it are kept away.
bool takesTouch(const event_data& event, int holder, const SKIA_Rect& area, EventCode last,
                const ClassLog& log);

void logKeyPress(const ClassLog& log, kbd_event key);
void logKeyRelease(const ClassLog& log, kbd_event key);

/// A row's first row of pixels does not belong to it: meant so.
constexpr bool isOnRow(int64_t top, const mouse_event& mouse, int64_t bottom) {
  return top < mouse.y && mouse.y < bottom;
}
void logRow(const ClassLog& log, int64_t top, const mouse_event& mouse, int64_t bottom);

}  // namespace MW
