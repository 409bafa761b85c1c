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

constexpr int kSmallTextPercent = 30;  // of a row, where there are two lines

// The second line of the dialog that was constructed last and had one. A kind without one takes it
// over; none of those draws it.
constinit std::atomic<const char*> lastSecondLine = nullptr;

void putIfGiven(SKIA_Text& record, const char* words) {
  if (words != nullptr) putText(record, boundedText(words));
}

}  // namespace

Dialog::Dialog(int dialogKind) : PromptDialog("DIALOG"), kind(dialogKind) {
  setRect(dialogKind);
  fillIn();
  Window::registerWidget(this);
}

Dialog::~Dialog() { leaveWindow(); }

void Dialog::fillIn() {
  const CatalogueEntry& entry = catalogueEntry(kind);
  const auto& [firstLine, secondLine] = entry.lines;
  const auto& [left, right, touches] = entry.buttons;
  button1.enabled = touches == Touches::None ? 0 : 1;
  button2.enabled = touches == Touches::Both ? 1 : 0;
  if (entry.letterSize != 0) message.size = entry.letterSize;
  if (entry.letterSize != 0 && secondLine != nullptr) second.size = entry.letterSize;
  if (secondLine != nullptr) lastSecondLine = secondLine;
  putIfGiven(frame.title, entry.title);
  putIfGiven(message, firstLine);
  putIfGiven(second, secondLine != nullptr ? secondLine : lastSecondLine.load());
  putIfGiven(button1.caption, left);
  putIfGiven(button2.caption, right);
}

int Dialog::show(unsigned int ticks) {
  const DialogLayout& layout = dialogLayout(kind);
  const std::lock_guard guard(stateLock);
  frame.backdrop.color = layout.backdrop;
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
  if (event == nullptr) return false;
  switch (event->type) {
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    default: return PromptDialog::onRecvEvent(event, arg);
  }
}

int Dialog::isType(int dialogKind) { return dialogLayout(dialogKind).number; }

void Dialog::setRect(int dialogKind) {
  const ScreenSize screen = presentScreen();
  const DialogLayout& layout = dialogLayout(dialogKind);
  const DialogGrid grid = layOutGrid(screen, layout.rows);
  const auto smallText = toPixels(percentOf(grid.row, kSmallTextPercent));
  const bool isSmall = layout.secondLine == SecondLine::Drawn;
  const bool isWide = layout.buttons == Buttons::One || layout.buttons == Buttons::Progress;

  const std::lock_guard guard(stateLock);
  layOutFrame(frame, screen, grid);
  styleTitle(frame.title, layout.align);
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

void Dialog::onPressKey(kbd_event key) { pressKey(key, kind); }

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
