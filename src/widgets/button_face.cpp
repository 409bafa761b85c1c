#include <MW/button_face.h>
#include <MW/window.h>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"
#include "core/redraw.h"

namespace MW {

ButtonFace::ButtonFace(const char* logWord, const SKIA_Rect* area, const SKIA_Text* caption)
    : word(logWord) {
  type_ = kBaseLayer;
  rect = copyRect(area);
  normalColor = rect.color;
  text = copyText(caption);
}

void ButtonFace::enterWindow(int constructorNumber) {
  ClassLog(word).print(LogLevel::Debug, "call %d registerWidget", constructorNumber);
  Window::registerWidget(this);
}

char* ButtonFace::getText() { return text.text; }
unsigned int ButtonFace::getBgColor() { return read(rect.color); }
unsigned int ButtonFace::getTextColor() { return read(text.color); }
int ButtonFace::getFontSize() { return read(text.size); }
SKIA_Rect* ButtonFace::getPositionAndSize() { return &rect; }
void ButtonFace::setFontSize(int pixels) { write(text.size, pixels); }

void ButtonFace::setText(const char* newText) {
  const std::lock_guard guard(stateLock);
  putText(text, boundedText(newText));
}

void ButtonFace::setTextColor(unsigned int color) { write(text.color, color); }

void ButtonFace::setRect(int, const SKIA_Rect* newRect) {
  if (newRect == nullptr) return;
  const std::lock_guard guard(stateLock);
  rect = {newRect->x, newRect->y, newRect->w, newRect->h, rect.color};
}

void ButtonFace::restoreColor() {
  if (getBgColor() == read(normalColor)) return;
  restoreFace();
  askForRedraw();
}

void ButtonFace::restoreFace() {
  const std::lock_guard guard(stateLock);
  rect.color = normalColor;
}

}  // namespace MW
