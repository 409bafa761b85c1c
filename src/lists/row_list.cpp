#include <MW/row_list.h>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"

namespace MW {

namespace {
constexpr int kTitleSize = 70;  // pixels, and so the rest
constexpr int kEdgeHeight = 2;
constexpr int kSlopPercent = 2;  // of the screen's width
}  // namespace

RowList::RowList(const char* logWord, const char* listTitle)
    : title{{}, 0, kColorWhite, SKIA_ALIGN_LEFT, kTitleSize}, word(logWord) {
  putText(title, boundedText(listTitle));
}

SKIA_Rect RowList::footLine(int screenWidth, int screenHeight) {
  return {0, screenHeight, screenWidth, kEdgeHeight, kColorBlack};
}

int RowList::clickSlop(int screenWidth) { return toPixels(percentOf(screenWidth, kSlopPercent)); }

int RowList::show() { return show(0); }

void RowList::lcdOn(int on) {
  if (lcdState.exchange(on) != on) hold.letGo();
}

bool RowList::takesTouch(const event_data& event, const SKIA_Rect& area, EventCode last) const {
  const bool isTouch = event.type >= kEventMotion && event.type <= last;
  const HeldBy holder = hold.heldBy(event.mouse);
  if (holder == HeldBy::Nobody) return isUnder(area, &event);
  if (holder == HeldBy::ThisFinger || !isTouch) return true;
  if (event.type != kEventMotion) {
    ClassLog(word).print(LogLevel::Debug, "onRecvEvent-> T:%d, F:%d", event.type,
                         static_cast<int>(event.mouse.finger));
  }
  return false;
}

void RowList::pressRow(int row) {
  const std::lock_guard guard(stateLock);
  click.press(row);
}

void RowList::logKeyPress(const kbd_event& key) const {
  ClassLog(word).print(LogLevel::Debug, "key pressed sym = %d", static_cast<int>(key.code));
}

void RowList::logKeyRelease(const kbd_event& key) const {
  ClassLog(word).print(LogLevel::Debug, "key onReleaseKey sym = %d", static_cast<int>(key.code));
}

void RowList::logHit(int64_t top, const mouse_event& mouse, int64_t bottom) const {
  ClassLog(word).print(LogLevel::Debug, "position2index= %04d < %04d > %04d", toPixels(top),
                       mouse.y, toPixels(bottom));
}

}  // namespace MW
