#include <MW/button_s.h>
#include <MW/event_service.h>

#include "core/class_log.h"

namespace MW {

ButtonS::ButtonS(const SKIA_Rect* area, const SKIA_Text* caption)
    : StyledButton("BUTTONS", kButtonBox, area, caption) {
  enterWindow(0);
}

ButtonS::ButtonS(int style, const SKIA_Rect* area, const SKIA_Text* caption)
    : StyledButton("BUTTONS", style, area, caption) {
  enterWindow(1);
}

ButtonS::~ButtonS() { leaveLayers(); }

bool ButtonS::onRecvEvent(event_data* event, unsigned int) {
  if (!isReachedBy(event)) return false;
  const bool isPassedOn = (buttonType & kPassOn) != 0;
  if (event->type != kEventMotion) return handleGesture(event) && !isPassedOn;
  if (!hold.isHeld()) return false;
  if (isPassedOn) onGetOutOfArea(event);
  return !isPassedOn;
}

void ButtonS::onRelease(event_data* event) {
  ClassLog(word).print(LogLevel::Debug, "released!!");
  hold.letGo();
  clickAt(event);
}

void ButtonS::onGetOutOfArea(event_data* event) {
  if (isUnder(rect, event)) return;
  const SKIA_Rect area = read(rect);
  if (!EventService::isMouseEventAroundMe(&area, event)) return;
  const ClassLog log(word);
  hold.letGo();
  clickCallback(0);
  log.print(LogLevel::Debug, "out of area!!");
}

}  // namespace MW
