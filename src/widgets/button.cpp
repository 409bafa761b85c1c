#include <MW/button.h>
#include <MW/window.h>

#include "core/bounded_text.h"

namespace MW {

Button::Button(const SKIA_Rect* area, const SKIA_Text* caption) : PushButton("BUTTON") {
  normalColor = area != nullptr ? area->color : 0;
  rect.color = normalColor;
  Button::setRect(0, area);
  text = copyText(caption);
  Window::registerWidget(this);
}

Button::~Button() { leaveLayers(); }

int Button::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (delayedShow.draws(ticks)) skia_add_buttonbox_c(rect, text);
  return 1;
}

char* Button::getText() { return text.text; }
unsigned int Button::getTextColor() { return read(text.color); }
int Button::getFontSize() { return read(text.size); }
void Button::setFontSize(int pixels) { write(text.size, pixels); }

void Button::setText(const char* newText) {
  const std::lock_guard guard(stateLock);
  putText(text, boundedText(newText));
}

void Button::setTextColor(unsigned int color) { write(text.color, color); }

void Button::setRect(int, const SKIA_Rect* newRect) {
  if (newRect == nullptr) return;
  const std::lock_guard guard(stateLock);
  rect = {newRect->x, newRect->y, newRect->w, newRect->h, rect.color};
}

}  // namespace MW
