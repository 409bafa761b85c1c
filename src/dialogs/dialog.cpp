#include <MW/dialog.h>
#include <MW/window.h>
#include <brimol/input.h>

#include "core/bounded_text.h"
#include "core/key_clicks.h"
#include "core/life_guard.h"
#include "dialogs/dialog_catalogue.h"
#include "dialogs/dialog_parts.h"

namespace MW {

namespace {

constexpr int kHookKeyKind = 13;
constexpr int kSmallTextPercent = 30;  // of a row, where there are two lines

// The second line of the kind that was constructed last and had one. A kind without one takes it:
// meant so.
constinit std::atomic<const char*> lastSecondLine = nullptr;

const DialogClass& classOf(int kind) { return dialogClass(Dialog::isType(kind)); }

void putIfGiven(SKIA_Text& record, const char* words) {
  if (words != nullptr) putText(record, boundedText(words));
}

}  // namespace

Dialog::Dialog(int dialogKind) : PromptDialog("DIALOG"), kind(dialogKind) {
  answersHookKey = kind == kHookKeyKind;
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
  putIfGiven(second, row.second != nullptr ? row.second : lastSecondLine.load());
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

bool Dialog::onRecvEvent(event_data* event, unsigned int arg) {
  if (event == nullptr || event->type != kEventKeyRelease) {
    return PromptDialog::onRecvEvent(event, arg);
  }
  onReleaseKey(event->key);
  return true;
}

int Dialog::isType(int dialogKind) { return MW::dialogKind(dialogKind).layout; }

void Dialog::setRect(int dialogKind) {
  const ScreenSize screen = presentScreen();
  const DialogClass& layout = classOf(dialogKind);
  const DialogGrid grid = layOutGrid(screen, layout.rows);
  const auto smallText = toPixels(percentOf(grid.row, kSmallTextPercent));
  const bool isSmall = layout.secondLine == SecondLine::Drawn;
  const bool isWide = layout.buttons == Buttons::One || layout.buttons == Buttons::Progress;

  const std::lock_guard guard(stateLock);
  layOutFrame(frame, screen, grid);
  styleTitle(frame.title, layout.align);
  frame.backdrop.color = layout.backdrop == Backdrop::Alarm ? kAlarmColor : kColorShadow;
  messageRect = messageArea(grid);
  if (isSmall) messageRect.h = smallText;
  message.color = kColorWhite;
  message.align = layout.align;
  message.size = isSmall ? smallText : kDialogTextSize;
  secondRect = makeRect(messageRect.x, messageRect.y + grid.row / 2, messageRect.w, smallText, 0);
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

void Dialog::onReleaseKey(kbd_event key) {
  keyClicks.follow(key, GetTicks());
  const LifeGuard self(this);
  onKeyClickCount(key);
  if (self.isAlive()) PromptDialog::onReleaseKey(key);
}

void Dialog::onKeyClickCount(kbd_event key) {
  const unsigned int now = GetTicks();
  {
    const std::lock_guard guard(stateLock);
    progress.delay(now);
  }
  tellKeyClicks(*this, keyClicks, keyClicks.click(key.code, now));
}

}  // namespace MW
