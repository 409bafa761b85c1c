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

void RowList::layOutFrame(int screenWidth, int screenHeight) {
  bottomEdge = {0, screenHeight, screenWidth, kEdgeHeight, kColorBlack};
  touchSlop = toPixels(percentOf(screenWidth, kSlopPercent));
}

int RowList::show() { return show(0); }

void RowList::lcdOn(int on) {
  if (lcdState.exchange(on) != on) hold.letGo();
}

void RowList::inClick(int dx, int dy) {
  const std::lock_guard guard(stateLock);
  click.move(dx, dy, touchSlop);
}

bool RowList::takesTouch(const event_data& event, EventCode last) const {
  const bool isTouch = event.type >= kEventMotion && event.type <= last;
  if (!isTouch || !hold.isOthers(event.mouse)) return hold.isHeld() || isUnder(listRect, &event);
  if (event.type != kEventMotion) {
    ClassLog(word).print(LogLevel::Debug, "onRecvEvent-> T:%d, F:%d", event.type,
                         static_cast<int>(event.mouse.finger));
  }
  return false;
}

void RowList::pressRow(const mouse_event& mouse, int row) {
  hold.press(mouse);
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
