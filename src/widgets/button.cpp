#include <MW/button.h>
#include <MW/window.h>

#include "core/pass_time.h"

namespace MW {

Button::Button(const SKIA_Rect* area, const SKIA_Text* caption)
    : PushButton("BUTTON", area, caption) {
  Window::registerWidget(this);
}

Button::~Button() { leaveLayers(); }

int Button::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (drawsAt(delayedShow, ticks)) skia_add_buttonbox_c(rect, text);
  return 1;
}

}  // namespace MW
