#include "input/wheel_drag.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>

namespace brimol::pc {

namespace {

constexpr int kNotchPercent = 8;  // of the screen's height
constexpr int kWhole = 100;
constexpr int kStepsPerNotch = 8;
constexpr int kLeastPart = 4;  // of a notch: what a drag begins with
constexpr uint32_t kStepMs = 10;
constexpr uint32_t kRestMs = 80;        // from the last move until the finger lifts
constexpr float kMostNotches = 100.0F;  // at once; keeps the arithmetic small

int pixelsOf(float notches, int notch) {
  if (std::isnan(notches)) return 0;
  const float bounded = std::clamp(notches, -kMostNotches, kMostNotches);
  return static_cast<int>(std::lround(bounded * static_cast<float>(notch)));
}

// The part of `left` that one step goes: faster, the more there is to catch up with.
int stepOf(int left, int notch) {
  const int speed = (std::max(std::abs(left), notch) + kStepsPerNotch - 1) / kStepsPerNotch;
  return std::clamp(left, -speed, speed);
}

int notchOf(Size screen) { return std::max(screen.h * kNotchPercent / kWhole, 1); }

}  // namespace

void WheelDrag::turn(ScreenPoint at, float toRight, float up, uint32_t now) {
  const int notch = notchOf(screen);
  if (grip && at != grip->start) {
    lift(now);
    right = down = 0;
  }
  const bool wasThere = isThere();
  right -= pixelsOf(toRight, notch);
  down += pixelsOf(up, notch);
  if (grip) {
    if (wasThere) nextStep = now + kStepMs;
  } else if (std::max(std::abs(right), std::abs(down)) >= notch / kLeastPart) {
    press(at, now);
  }
}

void WheelDrag::tick(uint32_t now) {
  if (msToStep(now) != 0) return;
  isThere() ? lift(now) : step(now);
}

std::optional<uint32_t> WheelDrag::msToStep(uint32_t now) const {
  if (!grip) return std::nullopt;
  const auto left = static_cast<int32_t>(nextStep - now);  // may be past, and times wrap
  return static_cast<uint32_t>(std::max(left, 0));
}

void WheelDrag::forget() {
  grip.reset();
  right = down = 0;
}

ScreenPoint WheelDrag::next(ScreenPoint from) const {
  const int notch = notchOf(screen);
  return {std::clamp(from.x + stepOf(right, notch), 0, screen.w - 1),
          std::clamp(from.y + stepOf(down, notch), 0, screen.h - 1)};
}

// A finger that goes down moves at once: one that lifted where it went down would be a tap. Without
// room to move, the rest of the way is dropped.
void WheelDrag::press(ScreenPoint at, uint32_t now) {
  const ScreenPoint first = next(at);
  if (first == at) {
    right = down = 0;
    return;
  }
  grip = {at, at};
  input.pointerDown(kWheel, at, now);
  moveTo(first, now);
}

void WheelDrag::lift(uint32_t now) {
  input.pointerUp(kWheel, grip->at, now);
  grip.reset();
}

void WheelDrag::step(uint32_t now) {
  const ScreenPoint to = next(grip->at);
  if (to == grip->at) {
    const ScreenPoint start = grip->start;
    lift(now);
    press(start, now);
  } else {
    moveTo(to, now);
  }
}

void WheelDrag::moveTo(ScreenPoint to, uint32_t now) {
  right -= to.x - grip->at.x;
  down -= to.y - grip->at.y;
  grip->at = to;
  input.pointerMove(kWheel, to, now);
  nextStep = now + (isThere() ? kRestMs : kStepMs);
}

}  // namespace brimol::pc
