#include <MW/slide.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <atomic>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"
#include "core/life_guard.h"
#include "widgets/knob_route.h"

namespace MW {

namespace {

constexpr ClassLog kLog("SLIDE");
constexpr int kLegendSize = 80;  // pixels
constexpr uint32_t kOffColor = 0xFF787878;
constexpr int kTwoCaptions = 2;

constexpr int kTrackUnits = 5;
constexpr int kKnobUnits = 2;
constexpr int kTravelUnits = kTrackUnits - kKnobUnits;

constexpr bool isRight(int state) {
  return state == Slide::kFullRight || state == Slide::kHalfRight;
}
constexpr bool isLeft(int state) { return state == Slide::kFullLeft || state == Slide::kHalfLeft; }

constexpr SKIA_Text kOn = {"ON", 2, kColorGreen, SKIA_ALIGN_CENTRE, kLegendSize};
constexpr SKIA_Text kOff = {"OFF", 3, kOffColor, SKIA_ALIGN_CENTRE, kLegendSize};

// The second caption has the length that its record says, and of its text as many bytes as its size
// says; NULs fill what is missing.
SKIA_Text secondCaption(const SKIA_Text* given) {
  SKIA_Text caption = {};
  if (given == nullptr) return caption;
  const auto length = static_cast<std::size_t>(std::clamp(given->string_len, 0, kTextMax));
  const auto taken = static_cast<std::size_t>(std::max(given->size, 0));
  const std::string_view bytes = cutText({given->text, length}, taken);
  std::copy(bytes.begin(), bytes.end(), caption.text);
  caption.string_len = static_cast<int32_t>(length);
  caption.color = given->color;
  caption.align = given->align;
  caption.size = given->size;
  return caption;
}

}  // namespace

Slide::Slide(int startState, const SKIA_Rect* area, const SKIA_Text* first, const SKIA_Text* second)
    : Slide(Look::Legends, startState, area, first, second) {}

Slide::Slide(Look switchLook, int startState, const SKIA_Rect* area, const SKIA_Text* first,
             const SKIA_Text* second)
    : state(startState), look(switchLook), captionCount(second != nullptr ? kTwoCaptions : 1) {
  kLog.print(LogLevel::Debug, "call registerWidget");
  setType(kBaseLayer);
  caption1 = copyText(first);
  caption2 = secondCaption(second);
  Slide::setRect(startState, area);
  Window::registerWidget(this);
}

Slide::~Slide() { leaveWindow(); }

int Slide::show() { return show(0); }

int Slide::show(unsigned int) {
  if (!hold.isHeld()) snapKnob();
  const std::lock_guard guard(stateLock);
  labelRect1.x = rect.x;
  labelRect2.x = rect.x;
  if (locked == 0) drawTrack();
  skia_add_box_c(rect);
  skia_add_label_c(labelRect1, caption1);
  if (captionCount == kTwoCaptions) skia_add_label_c(labelRect2, caption2);
  if (locked != 0) {
    lockRect = {rect.x, rect.y, rect.w, rect.h, kColorShadow};
    skia_add_box_c(lockRect);
  }
  return 1;
}

void Slide::drawTrack() const {
  skia_add_box_c(track);
  if (look == Look::Plain) return;
  skia_add_label_c(leftSlot, kOn);
  skia_add_label_c(rightSlot, kOff);
}

int Slide::hide() {
  active = false;  // not setActive: a finger that holds the knob goes on to be followed
  return 1;
}

bool Slide::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  return routeKnobTouch(*this, knobHold.touch(*event, read(rect)), event);
}

void Slide::onPress(event_data* event) {
  if (event == nullptr) return;
  knobHold.grab(event->mouse);
  kLog.print(LogLevel::Debug, "pressed!!: %d", static_cast<int>(event->mouse.finger));
  if (locked != 0 && doubleClickCallback) clicks.press(GetTicks());
}

void Slide::onRelease(event_data* event) {
  if (event == nullptr) return;
  knobHold.letGo();
  snapKnob();
  kLog.print(LogLevel::Debug, "released!!:%d", static_cast<int>(event->mouse.finger));
  if (locked != 0 && isUnder(rect, event) && doubleClickCallback && clicks.isRunning()) {
    onTouchClickCount(event->mouse);
  }
}

void Slide::onHover(mouse_event mouse) {
  if (locked != 0) return;
  const Change change = drag(mouse.xrel);
  if (change == Change::None) return;
  const LifeGuard self(this);
  (change == Change::ToLeft ? leftCallback : rightCallback)(0);
  if (!self.isAlive()) return;
  knobHold.letGo();
  snapKnob();
}

// Full-travel switches change at the far end, half-travel ones within a unit of it.
Slide::Change Slide::drag(int by) {
  const std::lock_guard guard(stateLock);
  const int64_t left = track.x;
  const int64_t end = left + int64_t{kTravelUnits} * unit - 1;
  const int64_t wanted = int64_t{rect.x} + by;
  rect.x = toPixels(wanted <= left ? left : std::min(wanted, end));
  const bool isAtLeft = wanted <= left;
  const bool isAtRight = !isAtLeft && wanted >= end;
  const std::atomic_ref shared(state);
  const int now = shared;
  const bool goesLeft = isAtLeft || (!isAtRight && now == kHalfRight && wanted <= left + unit);
  const bool goesRight = isAtRight || (!isAtLeft && now == kHalfLeft && wanted > end - unit);
  if (goesLeft && isRight(now)) {
    shared = now - 1;
    return Change::ToLeft;
  }
  if (goesRight && isLeft(now)) {
    shared = now + 1;
    return Change::ToRight;
  }
  return Change::None;
}

void Slide::onTouchClickCount(mouse_event mouse) {
  const int count = clicks.tap(GetTicks());
  if (count == 0) return;
  kLog.print(LogLevel::Debug, "onTouchClickCount!! %d", count);
  if (count != DoubleTap::kDouble) return;
  mouse.state = static_cast<uint32_t>(locked);
  doubleClickCallback(&mouse);
}

void Slide::setRect(int newState, const SKIA_Rect* area) {
  if (area == nullptr) return;
  const std::lock_guard guard(stateLock);
  const SKIA_Rect to = *area;
  const int height = to.h / 2 * 2;
  unit = to.w / kTrackUnits;
  track = {to.x, to.y, kTrackUnits * unit, height, kColorBlack};
  lockRect = {to.x, to.y, kTrackUnits * unit, height, kColorShadow};
  leftSlot = {to.x, to.y, kKnobUnits * unit, height, kColorWhite};
  if (look == Look::Plain) leftSlot = {to.x, to.y, to.w, to.h, kColorWhite};
  rightSlot = makeRect(int64_t{to.x} + int64_t{kTravelUnits} * unit, to.y,
                       int64_t{kKnobUnits} * unit, height, kColorWhite);
  rect = isRight(newState) ? rightSlot : leftSlot;
  labelRect1 = rect;
  labelRect2 = rect;
  if (captionCount != kTwoCaptions) return;
  const int half = to.h / 2;
  labelRect1.h = half;
  labelRect2 = makeRect(rect.x, int64_t{labelRect1.y} + half, rect.w, half, rect.color);
}

void Slide::Lock() { locked = 1; }
void Slide::unLock() { locked = 0; }

// The track is laid out from itself and so never moves; setRect reads it under the lock.
void Slide::snapKnob() { setRect(std::atomic_ref(state), &track); }

SlideV::SlideV(int startState, const SKIA_Rect* area, const SKIA_Text* first,
               const SKIA_Text* second)
    : Slide(Look::Plain, startState, area, first, second) {}

SlideV::~SlideV() { leaveWindow(); }

}  // namespace MW
