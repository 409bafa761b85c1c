#include <MW/dialog.h>
#include <MW/event_service.h>
#include <MW/window.h>
#include <brimol/input.h>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/key_clicks.h"
#include "core/life_guard.h"
#include "dialogs/dialog_catalogue.h"
#include "dialogs/dialog_parts.h"

namespace MW {

namespace {

constexpr ClassLog kLog("DIALOG");
constexpr int kHookKeyKind = 13;
constexpr uint32_t kMostStars = 10;
constexpr int64_t kTextMargin = 10;    // pixels
constexpr int kSmallTextPercent = 30;  // of a row, where there are two lines

// The second line of the kind that was constructed last and had one. A kind without one keeps it:
// meant so.
constinit std::atomic<const char*> lastSecondLine = nullptr;

const DialogClass& classOf(int kind) { return dialogClass(Dialog::isType(kind)); }

void putIfGiven(SKIA_Text& record, const char* words) {
  if (words != nullptr) putText(record, boundedText(words));
}

}  // namespace

Dialog::Dialog(int dialogKind) : kind(dialogKind) {
  setType(kTopLayer);
  setRect(dialogKind);
  fillIn();
  Window::registerWidget(this);
}

Dialog::~Dialog() { leaveWindow(); }

void Dialog::fillIn() {
  const DialogKind& row = dialogKind(kind);
  button1.enabled = row.enabled1;
  button2.enabled = row.enabled2;
  if (row.messageSize != 0) message.size = row.messageSize;
  if (row.secondSize != 0) second.size = row.secondSize;
  if (row.second != nullptr) lastSecondLine = row.second;
  putIfGiven(frame.title, row.title);
  putIfGiven(message, row.message);
  putIfGiven(second, lastSecondLine);
  putIfGiven(button1.caption, row.button1);
  putIfGiven(button2.caption, row.button2);
}

int Dialog::show(unsigned int ticks) {
  const DialogClass& layout = classOf(kind);
  const std::lock_guard guard(stateLock);
  frame.body.color = updateBlink(ticks);
  drawFrame(frame);
  skia_add_label_c(messageRect, message);
  if (layout.secondLine == SecondLine::Drawn) skia_add_label_c(secondRect, second);
  switch (layout.buttons) {
    case Buttons::None: break;
    case Buttons::Progress: drawProgress(ticks); break;
    case Buttons::One: drawButton(button1); break;
    case Buttons::Two:
      drawButton(button1);
      drawButton(button2);
      break;
  }
  return 1;
}

void Dialog::updateProgress(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  drawProgress(ticks);
}

// One to ten stars, and one again.
void Dialog::drawProgress(unsigned int ticks) {
  progress.step(ticks);
  const uint32_t steps = progress.count();
  putStars(button1.caption, steps == 0 ? 1 : (steps - 1) % kMostStars + 1);
  skia_add_box_c(button1.border);
  skia_add_textbox_c(button1.face, button1.caption);
}

int Dialog::hide() {
  setActive(0);
  lcdOnFlag = 1;
  return 1;
}

bool Dialog::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  switch (event->type) {
    case kEventMotion: return hoverAt(event);
    case kEventPress: return pressAt(event);
    case kEventRelease: releaseAt(event); return true;
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    case kEventUser: onPlugKey(event->key); return true;
    default: return false;
  }
}

bool Dialog::hoverAt(event_data* event) {
  const LifeGuard self(this);
  onHover(event);
  if (!self.isAlive() || select == 0) return false;
  for (DialogButton* const button : {&button1, &button2}) {
    if (button->enabled != 0 && !isOn(*button, event)) restoreFace(*button);
  }
  return true;
}

// Only a button takes a press.
bool Dialog::pressAt(event_data* event) {
  const LifeGuard self(this);
  onPress(event);
  if (!self.isAlive() || lcdOnFlag == 0) return false;
  if (button1.enabled != 0 && isOn(button1, event)) {
    onBtn1Pressed(event->mouse);
    return true;
  }
  if (button2.enabled != 0 && isOn(button2, event)) {
    onBtn2Pressed(event->mouse);
    return true;
  }
  return false;
}

// Both buttons answer where their faces overlap, which they do where one wide button hides an
// enabled second one: meant so.
void Dialog::releaseAt(event_data* event) {
  const LifeGuard self(this);
  const bool answers = lcdOnFlag != 0;
  if (answers && button1.enabled != 0) {
    restoreFace(button1);
    if (isOn(button1, event)) onBtn1Released(event->mouse);
  }
  if (self.isAlive() && answers && button2.enabled != 0) {
    restoreFace(button2);
    if (isOn(button2, event)) onBtn2Released(event->mouse);
  }
  if (self.isAlive()) onRelease(event);
}

void Dialog::lcdOn(int on) { lcdOnFlag = on; }

void Dialog::onHover(event_data* event) {
  if (event != nullptr) hoverCallback(&event->mouse);
}

void Dialog::onPress(event_data* event) {
  if (event != nullptr) pressCallback(&event->mouse);
}

void Dialog::onRelease(event_data* event) {
  if (event != nullptr) clickCallback(&event->mouse);
}

void Dialog::onPlugKey(kbd_event key) {
  kLog.print(LogLevel::Debug, "key onPlugKey sym = %d", static_cast<int>(key.code));
  plugCallback(&key);
}

int Dialog::isType(int dialogKind) { return MW::dialogKind(dialogKind).layout; }

void Dialog::setRect(int dialogKind) {
  Window::getwindowsize(&screenW, &screenH);
  const ScreenSize screen = {screenW, screenH};
  const DialogClass& layout = classOf(dialogKind);
  const DialogGrid grid = layOutGrid(screen, layout.rows);
  const auto smallText = toPixels(percentOf(grid.row, kSmallTextPercent));
  const bool isSmall = layout.secondLine == SecondLine::Drawn;
  const bool isWide = layout.buttons == Buttons::One || layout.buttons == Buttons::Progress;

  const std::lock_guard guard(stateLock);
  layOutFrame(frame, screen, grid);
  frame.title.align = layout.align;
  if (layout.backdrop == Backdrop::Alarm) frame.backdrop.color = kAlarmColor;
  messageRect =
      makeRect(grid.x + kTextMargin, grid.y + grid.row + kTextMargin, grid.w - 2 * kTextMargin,
               isSmall ? smallText : grid.row - 2 * kTextMargin, 0);
  message.color = kColorWhite;
  message.align = layout.align;
  message.size = isSmall ? smallText : kDialogTextSize;
  secondRect = makeRect(grid.x + kTextMargin, grid.y + grid.row + grid.row / 2 + kTextMargin,
                        grid.w - 2 * kTextMargin, smallText, 0);
  second.color = kColorWhite;
  second.align = layout.align;
  second.size = smallText;
  placeButton(button1, grid, isWide ? wideFace(grid) : leftFace(grid));
  placeButton(button2, grid, rightFace(grid));
  btnNormalColor = kColorWhite;
}

void Dialog::setTitle(const char* newTitle) {
  const std::lock_guard guard(stateLock);
  putTextOpen(frame.title, boundedText(newTitle));
}

void Dialog::setDesc(const char* newMessage) {
  const std::lock_guard guard(stateLock);
  putTextOpen(message, boundedText(newMessage));
}

void Dialog::onBtn1Pressed(mouse_event mouse) {
  kLog.print(LogLevel::Debug, "btn1 pressed!!");
  pressButton(button1, mouse);
}

void Dialog::onBtn2Pressed(mouse_event mouse) {
  kLog.print(LogLevel::Debug, "btn2 pressed!!");
  pressButton(button2, mouse);
}

void Dialog::onBtn1Released(mouse_event) {
  kLog.print(LogLevel::Debug, "btn1 released!!");
  button1Callback(0);
}

// The right button dismisses the dialog by itself, the left one does not: meant so.
void Dialog::onBtn2Released(mouse_event) {
  kLog.print(LogLevel::Debug, "btn2 released!!");
  hide();
  button2Callback(0);
}

void Dialog::onPressKey(kbd_event key) {
  if (key.code == kKeyHook) {
    if (kind == kHookKeyKind) onHookKeyPressed();
    return;
  }
  kLog.print(LogLevel::Debug, "key pressed sym = %d", static_cast<int>(key.code));
  keyPressCallback(&key);
}

void Dialog::onReleaseKey(kbd_event key) {
  keyClicks.follow(key, GetTicks());
  const LifeGuard self(this);
  onKeyClickCount(key);
  kLog.print(LogLevel::Debug, "key onReleaseKey sym = %d", static_cast<int>(key.code));
  if (self.isAlive()) keyReleaseCallback(&key);
}

void Dialog::onHookKeyPressed() {
  kLog.print(LogLevel::Debug, "Hook key pressed!!");
  hookKeyCallback(0);
}

void Dialog::onKeyClickCount(kbd_event key) {
  const unsigned int now = GetTicks();
  {
    const std::lock_guard guard(stateLock);
    progress.delay(now);
  }
  tellKeyClicks(*this, keyClicks, keyClicks.click(key.code, now));
}

void Dialog::pressButton(DialogButton& button, const mouse_event& mouse) {
  write(button.face.color, kColorHighlight);
  setSelect(static_cast<int>(mouse.finger + 1));
}

bool Dialog::isOn(const DialogButton& button, const event_data* event) const {
  const SKIA_Rect face = read(button.face);
  return EventService::isMouseEventForMe(&face, event);
}

void Dialog::restoreFace(DialogButton& button) {
  const std::lock_guard guard(stateLock);
  button.face.color = btnNormalColor;
}

}  // namespace MW
