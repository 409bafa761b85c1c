#include <MW/styled_button.h>

#include "core/class_log.h"
#include "core/life_guard.h"
#include "core/pass_time.h"

namespace MW {

StyledButton::StyledButton(const char* logWord, int style, const SKIA_Rect* area,
                           const SKIA_Text* caption)
    : PushButton(logWord, area, caption) {
  buttonType = style;
}

int StyledButton::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  drawFace(ticks);
  return 1;
}

bool StyledButton::drawFace(unsigned int ticks) {
  if (!drawsAt(delayedShow, ticks)) return false;
  if (buttonType == kButtonBox) {
    skia_add_buttonbox_c(rect, text);
  } else {
    skia_add_textbox_c(rect, text);
  }
  return true;
}

void StyledButton::setBgColor(unsigned int color) { write(rect.color, color); }

void StyledButton::onPress(event_data* event) {
  if (event == nullptr) return;
  ClassLog(word).print(LogLevel::Debug, "pressed!!");
  holdBy(event);
}

void StyledButton::onPressLong(event_data*) {
  ClassLog(word).print(LogLevel::Debug, "long pressed!!");
  const LifeGuard self(this);
  longPressCallback(0);
  if (self.isAlive()) hold.letGo();
}

}  // namespace MW
