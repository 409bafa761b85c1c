/// The screen as widgets lay themselves out on it.
#pragma once

#include <MW/window.h>

#include "core/geometry.h"

namespace MW {

/// The window's present size. Any thread.
inline ScreenSize presentScreen() {
  ScreenSize screen = {};
  Window::getwindowsize(&screen.w, &screen.h);
  return screen;
}

}  // namespace MW
