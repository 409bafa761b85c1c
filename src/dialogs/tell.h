/// Calls of an application's typed callbacks.
#pragma once

#include <MW/records.h>

namespace MW {

// Null callbacks and events: nothing. The record is the callee's for the call.

inline void tell(void (*call)(mouse_event*), mouse_event mouse) {
  if (call != nullptr) call(&mouse);
}
inline void tell(void (*call)(mouse_event*), event_data* event) {
  if (call != nullptr && event != nullptr) call(&event->mouse);
}
inline void tell(void (*call)(kbd_event*), kbd_event key) {
  if (call != nullptr) call(&key);
}

}  // namespace MW
