#include <MW/framed_dialog.h>

#include "core/class_log.h"
#include "core/life_guard.h"
#include "dialogs/tell.h"

namespace MW {

FramedDialog::FramedDialog(const char* logWord) : word(logWord) { type_ = kTopLayer; }

void FramedDialog::startOver() {
  pressCallback = hoverCallback = clickCallback = nullptr;
  keyPressCallback = keyReleaseCallback = nullptr;
  button1Callback = button2Callback = nullptr;
  lcdOnFlag = 1;
  write(rect.x, 0);
}

int FramedDialog::hide() {
  setActive(0);
  lcdOnFlag = 1;
  return 1;
}

bool FramedDialog::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  switch (event->type) {
    case kEventMotion: return hoverAt(event);
    case kEventPress: return pressAt(event) != nullptr;  // only a button takes a press
    case kEventRelease: return releaseAt(event);
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    default: return false;
  }
}

bool FramedDialog::hoverAt(event_data* event) {
  const LifeGuard self(this);
  onHover(event);
  if (!self.isAlive() || !hold.isHeld()) return false;
  if (!followsMotionInTheDark && lcdOnFlag == 0) return false;
  for (DialogButton* const button : {&button1, &button2}) {
    if (!isOn(*button, event)) restoreFace(*button);
  }
  return true;
}

const DialogButton* FramedDialog::pressAt(event_data* event) {
  const LifeGuard self(this);
  onPress(event);
  if (!self.isAlive() || lcdOnFlag == 0) return nullptr;
  if (isOn(button1, event)) {
    onBtn1Pressed(event->mouse);
    return &button1;
  }
  if (isOn(button2, event)) {
    onBtn2Pressed(event->mouse);
    return &button2;
  }
  return nullptr;
}

bool FramedDialog::releaseAt(event_data* event) {
  if (releaseButtons(event)) onRelease(event);
  return true;
}

// Both answer where their faces overlap: one wide button may hide an enabled second one.
bool FramedDialog::releaseButtons(const event_data* event) {
  if (lcdOnFlag == 0) return true;
  const LifeGuard self(this);
  if (liftFrom(button1, event)) (this->*answer1)(event->mouse);
  if (self.isAlive() && liftFrom(button2, event)) (this->*answer2)(event->mouse);
  return self.isAlive();
}

bool FramedDialog::liftFrom(DialogButton& button, const event_data* event) {
  restoreFace(button);
  return isOn(button, event);
}

void FramedDialog::lcdOn(int on) { lcdOnFlag = on; }

void FramedDialog::onHover(event_data* event) { tell(hoverCallback, event); }
void FramedDialog::onPress(event_data* event) { tell(pressCallback, event); }
void FramedDialog::onRelease(event_data* event) { tell(clickCallback, event); }

void FramedDialog::onBtn1Pressed(mouse_event mouse) {
  ClassLog(word).print(LogLevel::Debug, "btn1 pressed!!");
  pressButton(button1, mouse);
}

void FramedDialog::onBtn2Pressed(mouse_event mouse) {
  ClassLog(word).print(LogLevel::Debug, "btn2 pressed!!");
  pressButton(button2, mouse);
}

void FramedDialog::onBtn1Released(mouse_event) {
  ClassLog(word).print(LogLevel::Debug, "btn1 released!!");
  button1Callback(0);
}

void FramedDialog::onBtn2Released(mouse_event) {
  ClassLog(word).print(LogLevel::Debug, "btn2 released!!");
  hide();
  button2Callback(0);
}

void FramedDialog::onPressKey(kbd_event key) {
  ClassLog(word).print(LogLevel::Debug, "key pressed sym = %d", static_cast<int>(key.code));
  keyPressCallback(&key);
}

void FramedDialog::onReleaseKey(kbd_event key) {
  ClassLog(word).print(LogLevel::Debug, "key onReleaseKey sym = %d", static_cast<int>(key.code));
  keyReleaseCallback(&key);
}

void FramedDialog::pressButton(DialogButton& button, const mouse_event& mouse) {
  write(button.face.color, kColorHighlight);
  hold.press(mouse);
}

bool FramedDialog::isOn(const DialogButton& button, const event_data* event) const {
  return read(button.enabled) != 0 && isUnder(button.face, event);
}

// A button that takes no touches keeps its face.
void FramedDialog::restoreFace(DialogButton& button) {
  const std::lock_guard guard(stateLock);
  if (button.enabled != 0) button.face.color = btnNormalColor;
}

}  // namespace MW
