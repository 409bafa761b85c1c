#include <MW/dialog.h>
#include <MW/dialog_slide.h>
#include <MW/window.h>

#include "core/class_log.h"
#include "core/life_guard.h"
#include "dialogs/dialog_parts.h"
#include "dialogs/tell.h"

namespace MW {

namespace {

constexpr ClassLog kLog("DIALOGSLIDE");
constexpr int kLastRepeatKind = 5;
constexpr int kFrameRows = 3;
constexpr int kMessageSize = 70;  // pixels, and so the rest
constexpr int kParts = 3;         // of the slide row
constexpr int kPartLoss = 4;      // what the gaps take from each of them

void answer(const char* side, void (*call)(int)) {
  kLog.print(LogLevel::Debug, "%s", side);
  if (call != nullptr) call(0);
}

}  // namespace

DialogSlide::DialogSlide(int dialogKind) : kind(dialogKind) {
  setType(kTopLayer);
  setRect_init(dialogKind);
  setRect(dialogKind);
  if (kind >= kRepeatPassedTest && kind <= kLastRepeatKind) {
    setTitle("Warning");
    setDesc("Test already pass. Try again?");
    setLeft("CANCEL");
    setRight("OK");
    setSlide("<AAT>", 0);
  }
  Window::registerWidget(this);
}

DialogSlide::~DialogSlide() { leaveWindow(); }

int DialogSlide::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  frame.body.color = updateBlink(ticks);
  drawFrame(frame);
  skia_add_label_c(messageRect, message);
  skia_add_roundbox_c(slideRow);
  skia_add_label_c(leftRect, leftCaption);
  skia_add_label_c(rightRect, rightCaption);
  skia_add_roundtextbox_c(thumb, thumbCaption);
  return 1;
}

int DialogSlide::hide() {
  setActive(0);
  lcdOnFlag = 1;
  return 1;
}

bool DialogSlide::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  const LifeGuard self(this);
  switch (event->type) {
    case kEventMotion: onHover(event); return self.isAlive() && slideAt(event);
    case kEventPress: onPress(event); return self.isAlive() && grabAt(event);
    case kEventRelease: onRelease(event); return self.isAlive() && letGoAt(event);
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    default: return false;
  }
}

bool DialogSlide::slideAt(const event_data* event) {
  if (!isHeldBy(event->mouse)) return false;
  onSlideHover(event->mouse);
  return true;
}

bool DialogSlide::letGoAt(const event_data* event) {
  if (!isHeldBy(event->mouse)) return false;
  onSlideReleased(event->mouse);
  return true;
}

bool DialogSlide::grabAt(const event_data* event) {
  if (lcdOnFlag == 0 || !isUnder(thumbHome, event)) return false;
  onSlidePressed(event->mouse);
  return true;
}

bool DialogSlide::isHeldBy(const mouse_event& mouse) const {
  return hold.isOwner(mouse) && lcdOnFlag != 0;
}

void DialogSlide::lcdOn(int on) { lcdOnFlag = on; }

void DialogSlide::onHover(event_data* event) { tell(hoverCallback, event); }
void DialogSlide::onPress(event_data* event) { tell(touchPressCallback, event); }
void DialogSlide::onRelease(event_data* event) { tell(touchReleaseCallback, event); }

int DialogSlide::isType(int) { return Dialog::kStandard; }

void DialogSlide::setRect_init(int) {
  const ScreenSize screen = presentScreen();
  const DialogGrid grid = layOutGrid(screen, kFrameRows);
  const int64_t x = grid.x + 1;
  const int64_t y = grid.y + grid.row + grid.body + 1;
  const int64_t part = grid.w / kParts - kPartLoss;
  const int64_t height = grid.row - 2;
  const std::lock_guard guard(stateLock);
  layOutFrame(frame, screen, grid);
  styleTitle(frame.title, SKIA_ALIGN_CENTRE);
  messageRect = messageArea(grid);
  slideRow = makeRect(x, y, grid.w - 2, height, kColorWhite);
  leftRect = makeRect(x, y, part, height, 0);
  thumbHome = makeRect(x + part + 1, y, part, height, kColorBlack);
  rightRect = makeRect(x + 2 * part + 2, y, part, height, kColorBlack);
  style(message, kColorWhite, SKIA_ALIGN_LEFT, kMessageSize);
  style(second, kColorWhite, SKIA_ALIGN_LEFT, kMessageSize);
  style(leftCaption, kColorBlack, SKIA_ALIGN_CENTRE, captionSize(grid));
  style(thumbCaption, kColorWhite, SKIA_ALIGN_CENTRE, captionSize(grid));
  style(rightCaption, kColorBlack, SKIA_ALIGN_CENTRE, captionSize(grid));
}

void DialogSlide::setRect(int) {
  const std::lock_guard guard(stateLock);
  thumb = thumbHome;
}

void DialogSlide::setTitle(const char* newTitle) { replace(frame.title, newTitle); }
void DialogSlide::setDesc(const char* newMessage) { replace(message, newMessage); }
void DialogSlide::setDesc2(const char* newMessage) { replace(second, newMessage); }
void DialogSlide::setLeft(const char* caption) { replace(leftCaption, caption); }
void DialogSlide::setRight(const char* caption) { replace(rightCaption, caption); }

void DialogSlide::setSlide(const char* caption, int width) {
  replace(thumbCaption, caption);
  if (width != 0) write(thumbHome.w, width);
}

void DialogSlide::replace(SKIA_Text& record, const char* words) {
  const std::lock_guard guard(stateLock);
  putText(record, wholeText(words, kTextMax).value_or(""));
}

void DialogSlide::onSlidePressed(mouse_event mouse) {
  hold.press(mouse);
  kLog.print(LogLevel::Debug, "onSlidePressed!!: %d", FingerHold::wordOf(mouse));
}

void DialogSlide::onSlideHover(mouse_event mouse) {
  const std::lock_guard guard(stateLock);
  const int64_t left = slideRow.x;
  const int64_t right = left + slideRow.w - thumb.w;
  const int64_t wanted = int64_t{thumb.x} + mouse.xrel;
  if (wanted <= left) {
    slideState = kAtLeft;
    thumb.x = toPixels(left);
  } else if (wanted < right) {
    slideState = kBetween;
    thumb.x = toPixels(wanted);
  } else {
    slideState = kAtRight;
    thumb.x = toPixels(right);
  }
}

void DialogSlide::onSlideReleased(mouse_event mouse) {
  hold.letGo();
  setRect(kind);
  kLog.print(LogLevel::Debug, "onSlideReleased!!:%d", FingerHold::wordOf(mouse));
  switch (read(slideState)) {
    case kAtLeft: answer("Left Slide", leftCallback); break;
    case kAtRight: answer("Right Slide", rightCallback); break;
    default: break;
  }
}

void DialogSlide::onPressKey(kbd_event key) const {
  kLog.print(LogLevel::Debug, "key pressed sym = %d", static_cast<int>(key.code));
  tell(keyPressCallback, key);
}

void DialogSlide::onReleaseKey(kbd_event key) const {
  kLog.print(LogLevel::Debug, "key onReleaseKey sym = %d", static_cast<int>(key.code));
  tell(keyReleaseCallback, key);
}

}  // namespace MW
