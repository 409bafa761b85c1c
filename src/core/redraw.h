/// Asking for a frame from within a widget.
#pragma once

#include <MW/c_api.h>

namespace MW {

/// Raises the redraw flag: the application's loop draws in its next round. Any thread.
inline void askForRedraw() {
  constexpr int kRedraw = 1;
  EventService_AppEvent_c(kRedraw);
}

}  // namespace MW
