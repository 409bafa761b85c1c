#include <MW/slide_move.h>
#include <MW/window.h>

#include <algorithm>
#include <cfloat>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"
#include "widgets/knob_route.h"

namespace MW {

namespace {

constexpr ClassLog kLog("SLIDE");
constexpr int kDefaultKnobPercent = 20;
constexpr int kMostKnobPercent = 50;
constexpr int kInnerFrame = 1;  // pixels around the knob
constexpr int kOuterFrame = 2;
constexpr int kFillOverlap = 3;  // pixels that the fill reaches under the knob
constexpr int kTenths = 10;
constexpr int kValueTextPart = 3;  // of the knob's height

constexpr Padding kValuePadding = {' ', 3};

// From here on the value is full, even where the maximum lies above.
constexpr double kNearlyFull = 99.9;
constexpr int kFull = 100;

struct ValueRange {
  int lowest;
  int highest;
};

constexpr ValueRange rangeOf(int a, int b) {
  if (a == b) return {0, 1};
  return {std::min(a, b), std::max(a, b)};
}

// Goes by the bounds as they were given: with the higher one first, every start is a bound.
constexpr int startOf(int a, int b, int initial) {
  if (initial >= b) return b;
  return std::max(initial, a);
}

// What is cut off below tells wider numbers from those of the other machines.
static_assert(FLT_EVAL_METHOD == 0, "build with -msse2 -mfpmath=sse");

// Pixels for each step of the value; 0 where the knob cannot move.
constexpr float pixelsPerStep(int travel, ValueRange range) {
  const int64_t steps = int64_t{range.highest} - range.lowest;
  return static_cast<float>(std::max(travel, 0)) / static_cast<float>(steps);
}
static_assert(pixelsPerStep(400, {0, 100}) == 4 && pixelsPerStep(0, {0, 100}) == 0);

constexpr int valueAt(unsigned int position, float perStep, int lowest) {
  const float steps = static_cast<float>(position) / perStep;
  if (double{steps + static_cast<float>(lowest)} > kNearlyFull) return kFull;
  return toPixels(int64_t{truncated(steps)} + lowest);
}
static_assert(valueAt(399, 4, 0) == 99 && valueAt(400, 4, 0) == 100 && valueAt(40, 4, -5) == 5);

constexpr int shownKnobPercent(int percent) {
  return percent == SlideMove::kValueKnob ? kDefaultKnobPercent
                                          : std::min(percent, kMostKnobPercent);
}

}  // namespace

SlideMove::SlideMove(const SKIA_Rect* area, int percent, int a, int b, int initial)
    : minValue(rangeOf(a, b).lowest),
      maxValue(rangeOf(a, b).highest),
      knobPercent(shownKnobPercent(percent)),
      showValue(percent == kValueKnob ? 1 : 0),
      value(startOf(a, b, initial)) {
  kLog.print(LogLevel::Debug, "call registerWidget");
  setType(kBaseLayer);
  layOut(copyRect(area));
  Window::registerWidget(this);
}

SlideMove::~SlideMove() { leaveWindow(); }

int SlideMove::show() { return show(0); }

int SlideMove::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  if (showValue == 1) putNumber(valueText, value, kValuePadding, " %");
  fillUpTo(rect.x);
  skia_add_box_c(track);
  skia_add_box_c(groove);
  skia_add_box_c(fill);
  skia_add_box_c(frameOuter);
  skia_add_box_c(frameInner);
  if (showValue == 1) {
    skia_add_textbox_c(rect, valueText);
  } else {
    skia_add_box_c(rect);
  }
  return 1;
}

bool SlideMove::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  return routeKnobTouch(*this, knobHold.touch(*event, read(rect)), event);
}

void SlideMove::onPress(event_data* event) {
  if (event == nullptr) return;
  kLog.print(LogLevel::Debug, "pressed!!: %d", static_cast<int>(event->mouse.finger));
  knobHold.grab(event->mouse);
}

void SlideMove::onRelease(event_data* event) {
  if (event == nullptr) return;
  kLog.print(LogLevel::Debug, "released!!:%d", static_cast<int>(event->mouse.finger));
  knobHold.letGo();
}

void SlideMove::Lock() { locked = 1; }
void SlideMove::unLock() { locked = 0; }

void SlideMove::onHover(mouse_event mouse) {
  const std::lock_guard guard(stateLock);
  const int64_t left = track.x;
  const int64_t wanted = int64_t{rect.x} + mouse.xrel;
  rect.x = toPixels(wanted > left ? std::min(wanted, left + travel) : left);
  takeValueAt(static_cast<unsigned int>(rect.x - left));
}

void SlideMove::setRect(const SKIA_Rect* area) {
  if (area == nullptr) return;
  const SKIA_Rect to = *area;
  const std::lock_guard guard(stateLock);
  layOut(to);
}

void SlideMove::layOut(const SKIA_Rect& area) {
  track = area;
  const int64_t width = percentOf(track.w, knobPercent);
  travel = toPixels(track.w - width);
  const int64_t knobX = int64_t{track.x} + distanceOf(value);
  rect = makeRect(knobX, track.y, width, track.h, kColorDarkGrey);
  frameInner = grown(rect, kInnerFrame, kColorWhite);
  frameOuter = grown(rect, kOuterFrame, kColorBlack);
  fillUpTo(rect.x);
  groove = {track.x, fill.y, track.w, fill.h, kColorGrey};
  valueText.align = SKIA_ALIGN_CENTRE;
  valueText.size = rect.h / kValueTextPart;
  valueText.color = kColorWhite;
}

void SlideMove::setRect_Slide(const SKIA_Rect* knob) {
  if (knob == nullptr) return;
  const int32_t knobX = knob->x;
  const std::lock_guard guard(stateLock);
  fillUpTo(knobX);
}

// The frame's height and width stay.
void SlideMove::fillUpTo(int32_t knobX) {
  const int64_t margin = track.h / kTenths;
  fill = makeRect(track.x, int64_t{track.y} + margin, int64_t{knobX} - track.x + kFillOverlap,
                  int64_t{track.h} - 2 * margin, kColorRed);
  frameInner.x = toPixels(int64_t{knobX} - kInnerFrame);
  frameOuter.x = toPixels(int64_t{knobX} - kOuterFrame);
}

int SlideMove::getValue() const { return read(value); }

void SlideMove::setValue(unsigned int newValue) {
  const std::lock_guard guard(stateLock);
  value = static_cast<int>(newValue);
  layOut(track);
}

void SlideMove::setMove2Value(unsigned int position) {
  const std::lock_guard guard(stateLock);
  takeValueAt(position);
}

void SlideMove::takeValueAt(unsigned int position) {
  const float perStep = pixelsPerStep(travel, {minValue, maxValue});
  if (perStep > 0) value = valueAt(position, perStep, minValue);
}

int SlideMove::setValue2Move(unsigned int ofValue) {
  const std::lock_guard guard(stateLock);
  return distanceOf(static_cast<int>(ofValue));
}

int SlideMove::distanceOf(int ofValue) const {
  const int64_t steps = int64_t{ofValue} - minValue;
  return truncated(static_cast<float>(steps) * pixelsPerStep(travel, {minValue, maxValue}));
}

}  // namespace MW
