#include <MW/slide_e.h>
#include <MW/window.h>

#include <algorithm>
#include <atomic>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"

namespace MW {

namespace {

constexpr ClassLog kLog("SLIDE_EXIT");
constexpr const char* kMark = "EXIT";
constexpr int kMarkPercent = 25;  // of the bar's height

constexpr bool startsAtLeft(int state) { return state == 0 || state == 2 || state == 4; }
constexpr bool exitsAtLeft(int state) { return state == 1 || state == 3 || state == 5; }

}  // namespace

SlideE::SlideE(int startState, const SKIA_Rect* area, const SKIA_Text* caption, const char* unused)
    : state(startState) {
  if (area != nullptr) caption2.size = toPixels(percentOf(area->h, kMarkPercent));
  caption2.color = kColorBlack;
  caption2.align = SKIA_ALIGN_CENTRE;
  SlideE_init(startState, area, caption, unused);
}

SlideE::SlideE(int startState, const SKIA_Rect* area, const SKIA_Text* caption, const SKIA_Text*)
    : SlideE(startState, area, caption, "") {}

SlideE::SlideE(int startState, const SKIA_Rect* area, const SKIA_Text* caption, std::nullptr_t)
    : SlideE(startState, area, caption, "") {}

SlideE::~SlideE() { leaveWindow(); }

void SlideE::SlideE_init(int startState, const SKIA_Rect* area, const SKIA_Text* caption,
                         const char*) {
  kLog.print(LogLevel::Debug, "call registerWidget");
  setActive(0);
  setType(kBaseLayer);
  SlideE::setRect(startState, area);
  std::atomic_ref(state).store(startState);
  leftCallback = rightCallback = exitCallback = nullptr;
  {
    const std::lock_guard guard(stateLock);
    caption1 = copyText(caption);
    putText(caption2, kMark);
  }
  Window::registerWidget(this);
}

int SlideE::show() { return show(0); }

int SlideE::show(unsigned int) {
  if (!hold.isHeld()) snapKnob();
  const std::lock_guard guard(stateLock);
  skia_add_box_c(track);
  skia_add_label_c(labelRect1, caption1);
  skia_add_roundbox_c(rect);
  skia_add_arrow_c(rect, point);
  skia_add_label_c(rect, caption2);
  return 1;
}

bool SlideE::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  switch (knobHold.touch(*event, read(rect))) {
    case KnobHold::Touch::NotMine: return false;
    case KnobHold::Touch::Grab: onPress(event->mouse); return true;
    case KnobHold::Touch::Cancel:
      kLog.print(LogLevel::Debug, "Another touch finger pressed!\nDisabled button selection!");
      return true;
    case KnobHold::Touch::Move: onHover(event->mouse); return true;
    case KnobHold::Touch::Drop: break;
  }
  onRelease(event->mouse);
  return true;
}

void SlideE::onPress(mouse_event mouse) { knobHold.grab(mouse); }

void SlideE::onRelease(mouse_event) {
  knobHold.letGo();
  snapKnob();
}

void SlideE::onHover(mouse_event mouse) {
  if (!drag(mouse.xrel)) return;
  knobHold.letGo();
  exitCallback(0);
}

// Whether the knob has reached the end at which it exits.
bool SlideE::drag(int by) {
  const std::lock_guard guard(stateLock);
  const int64_t left = track.x;
  const int64_t end = left + track.w - unit;
  const int64_t wanted = int64_t{rect.x} + by;
  const bool isAtLeft = wanted <= left;
  rect.x = toPixels(isAtLeft ? left : std::min(wanted, end));
  const int now = std::atomic_ref(state);
  return isAtLeft ? exitsAtLeft(now) : wanted >= end && startsAtLeft(now);
}

void SlideE::setRect(int newState, const SKIA_Rect* area) {
  if (area == nullptr) return;
  const bool isAtLeft = startsAtLeft(newState);
  const std::lock_guard guard(stateLock);
  const SKIA_Rect to = *area;
  const int64_t behindKnob = int64_t{to.x} + to.h;
  const int64_t knobAtRight = int64_t{to.x} + to.w - to.h;
  unit = to.h;
  track = to;
  labelRect1 = makeRect(isAtLeft ? behindKnob : to.x, to.y, int64_t{to.w} - to.h, to.h, to.color);
  rect = makeRect(isAtLeft ? to.x : knobAtRight, to.y, to.h, to.h, kColorGrey);
  point.color = kColorRed;
  point.width = isAtLeft ? SKIA_ARROW_RIGHT : SKIA_ARROW_LEFT;
}

// The bar is laid out from itself and so never moves; setRect reads it under the lock.
void SlideE::snapKnob() { setRect(std::atomic_ref(state), &track); }

}  // namespace MW
