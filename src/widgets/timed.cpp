#include <MW/c_api.h>
#include <MW/detail/clock_order.h>
#include <MW/timed.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"
#include "core/pass_time.h"
#include "core/redraw.h"

namespace MW {

namespace {
constexpr ClassLog kToastLog("TOASTBOX");
constexpr ClassLog kBarLog("PROGRESSBAR");
constexpr int kTwoLines = 2;
constexpr int64_t kBarMargin = 2;  // pixels
constexpr uint32_t kMostStars = 10;
}  // namespace

Toastbox::Toastbox(const SKIA_Rect* area, const SKIA_Text* line) : lines(1) {
  init(area, line, nullptr);
}

Toastbox::Toastbox(const SKIA_Rect* area, const SKIA_Text* line, const SKIA_Text* message)
    : lines(kTwoLines) {
  init(area, line, message);
}

Toastbox::~Toastbox() { leaveWindow(); }

void Toastbox::init(const SKIA_Rect* area, const SKIA_Text* line, const SKIA_Text* message) {
  setActive(0);
  setType(kBaseLayer);
  Toastbox::setRect(lines, area);
  {
    const std::lock_guard guard(stateLock);
    hideAt = 0;
    toastText = copyText(line);
    if (message != nullptr) toastMsg = copyText(message);
  }
  kToastLog.print(LogLevel::Debug, "call registerWidget");
  Window::registerWidget(this);
}

int Toastbox::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (hideAt == 0 || hasEnded(ticks, hideAt, shownMs)) {
    hideAt = 0;
    setActive(0);
    return 1;
  }
  if (lines == kTwoLines) {
    skia_add_box_c(rect);
    skia_add_label_c(upperRect, toastText);
    skia_add_label_c(lowerRect, toastMsg);
  } else {
    skia_add_textbox_c(rect, toastText);
  }
  return 1;
}

void Toastbox::updateTimer(unsigned int ticks) {
  const bool ends = [&] {
    const std::lock_guard guard(stateLock);
    return hideAt != 0 && isOver(ticks, hideAt, shownMs);
  }();
  if (ends) isDisplayUpdate_c(1);
}

void Toastbox::setText(const char* newText) {
  const std::lock_guard guard(stateLock);
  putText(toastText, boundedText(newText));
}

void Toastbox::setMsg(const char* message) {
  if (lines != kTwoLines) return;
  const std::lock_guard guard(stateLock);
  putText(toastMsg, boundedText(message));
}

void Toastbox::onHideTimer(int ms) {
  {
    // Together, so that a drawing pass that ends the time before does not end this one.
    const std::lock_guard guard(stateLock);
    // An end at 0, which stands for none, comes a millisecond later.
    hideAt = std::max(GetTicks() + static_cast<unsigned int>(ms), 1U);
    shownMs = lengthOf(ms);
    setActive(1);
  }
  askForRedraw();
}

void Toastbox::setRect(int lineCount, const SKIA_Rect* newRect) {
  if (newRect == nullptr) return;
  const SKIA_Rect& to = *newRect;
  const int half = to.h / 2;
  const std::lock_guard guard(stateLock);
  rect = {to.x, to.y, to.w, 2 * half, to.color};
  if (lineCount != kTwoLines) return;
  upperRect = {to.x, to.y, to.w, half, 0};
  lowerRect = makeRect(to.x, int64_t{to.y} + half, to.w, half, 0);
}

Progressbar::Progressbar(int, const SKIA_Rect* area, const SKIA_Text* caption) {
  const SKIA_Rect given = copyRect(area);
  setType(kBaseLayer);
  Progressbar::setRect(0, &given);
  text = copyText(caption);
  starText.color = kColorWhite;
  starText.align = SKIA_ALIGN_CENTRE;
  starText.size = text.size;
  kBarLog.print(LogLevel::Debug, "call registerWidget");
  Window::registerWidget(this);
}

Progressbar::~Progressbar() { leaveWindow(); }

int Progressbar::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (running == 0) return 1;
  if (hasEnded(ticks, endAt, shownMs)) {
    setActive(0);
    endAt = 0;
    running = 0;
    return 1;
  }
  if (stars.step(ticks)) kBarLog.print(LogLevel::Debug, "show Star %u", stars.count());
  putStars(starText, stars.count() % kMostStars);
  skia_add_box_c(frameRect);
  skia_add_box_c(barRect);
  skia_add_textbox_c(textRect, text);
  skia_add_textbox_c(starRect, starText);
  return 1;
}

void Progressbar::updateTimer(unsigned int ticks) {
  const bool changes = [&] {
    const std::lock_guard guard(stateLock);
    return running != 0 && (isOver(ticks, endAt, shownMs) || stars.isDue(ticks));
  }();
  if (changes) isDisplayUpdate_c(1);
}

void Progressbar::setRect(int, const SKIA_Rect* newRect) {
  if (newRect == nullptr) return;
  const SKIA_Rect& to = *newRect;
  const int64_t height = 2 * int64_t{to.h};
  const std::lock_guard guard(stateLock);
  frameRect = makeRect(to.x, to.y, int64_t{to.w} - 2 * kBarMargin, height, kColorDarkGrey);
  barRect = makeRect(int64_t{to.x} + kBarMargin, int64_t{to.y} + kBarMargin, barRect.w,
                     height - 2 * kBarMargin, to.color);
  textRect = {to.x, to.y, to.w, to.h, 0};
  starRect = makeRect(to.x, int64_t{to.y} + to.h, to.w, to.h, 0);
}

void Progressbar::onProgressbar(int ms) {
  const std::lock_guard guard(stateLock);
  const unsigned int end = GetTicks() + static_cast<unsigned int>(ms);
  running = ms != 0 ? 1 : 0;
  endAt = running != 0 ? end : 0;
  shownMs = lengthOf(ms);
  stars.restart(end);
  setActive(running);
}

}  // namespace MW
