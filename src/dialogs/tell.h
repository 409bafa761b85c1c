/// Calls of an application's callbacks.
#pragma once

#include <MW/callback.h>
#include <MW/records.h>

namespace MW {

// A null callback or event: nothing. The record that a callback gets is a copy, so that it is valid
// even where the callback deletes the widget or ends the window.

inline void tell(void (*call)(mouse_event*), mouse_event mouse) {
  if (call != nullptr) call(&mouse);
}
inline void tell(void (*call)(mouse_event*), const event_data* event) {
  if (event != nullptr) tell(call, event->mouse);
}
inline void tell(void (*call)(kbd_event*), kbd_event key) {
  if (call != nullptr) call(&key);
}
inline void tell(const Callback& call, const event_data* event) {
  if (event == nullptr) return;
  mouse_event mouse = event->mouse;
  call(&mouse);
}

}  // namespace MW
