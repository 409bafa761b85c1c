#include <MW/screen.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <array>

#include "core/class_log.h"
#include "core/geometry.h"
#include "core/life_guard.h"
#include "core/present_screen.h"

namespace MW {

namespace {

constexpr ClassLog kLog("BUTTON");  // whoever reads the log finds the screen under this name
constexpr int kSquareSide = 50;     // pixels, and the least distance from an edge

// By FullScreen::Fill.
constexpr auto kFills = std::to_array<uint32_t>({kColorWhite, kColorRed, kColorGreen, kColorBlue});

constexpr uint32_t fillOf(int color) {
  const auto index = static_cast<std::size_t>(color);  // a negative one becomes huge
  return index < kFills.size() ? kFills.at(index) : kColorGrey;
}
static_assert(fillOf(-1) == kColorGrey && fillOf(3) == kColorBlue && fillOf(4) == kColorGrey);

}  // namespace

Screen::Screen() {
  kLog.print(LogLevel::Debug, "call registerWidget");
  setType(kBaseLayer);
  Window::getwindowsize(&screenW, &screenH);
  Window::registerWidget(this);
}

Screen::~Screen() { leaveWindow(); }

int Screen::show() { return 1; }
int Screen::show(unsigned int) { return 1; }

int Screen::hide() {
  active = false;  // not setActive: a finger that holds it goes on to be followed
  return 1;
}

bool Screen::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  const bool taken = (buttonType & kPassOn) == 0;
  switch (event->type) {
    case kEventMotion: onHover(event); return taken;
    case kEventPress: onPress(event); return taken;
    case kEventRelease: onRelease(event); return taken;
    case kEventLongPress: onPressLong(event); return taken;
    default: return false;
  }
}

void Screen::onHover(event_data* event) {
  if (event != nullptr) hoverCallback(&event->mouse);
}

void Screen::onPress(event_data* event) {
  if (event == nullptr) return;
  const mouse_event& mouse = event->mouse;
  kLog.print(LogLevel::Debug, "pressed!!");
  write(rect.color, kColorHighlight);
  hold.press(mouse);
  SKIA_Rect center = {};
  center.x = mouse.x;
  center.y = mouse.y;
  setRect(kSquare, &center);
  const LifeGuard self(this);
  pressCallback(&event->mouse);
  if (self.isAlive() && doubleClickCallback) clicks.press(GetTicks());
}

void Screen::onRelease(event_data* event) {
  if (event == nullptr) return;
  hold.letGo();
  const LifeGuard self(this);
  clickCallback(&event->mouse);
  if (!self.isAlive() || !doubleClickCallback) return;
  const SKIA_Rect square = read(rect);
  if (square.w == 0 || square.h == 0) return;
  if (!isUnder(rect, event)) {
    setRect(kNoSquare, &square);
  } else if (clicks.isRunning()) {
    onTouchClickCount();
  }
}

void Screen::onPressLong(event_data* event) {
  if (event != nullptr) longPressCallback(&event->mouse);
}

void Screen::setRect(int mode, const SKIA_Rect* center) {
  if (center == nullptr) return;
  const std::lock_guard guard(stateLock);  // `center` may be the square itself
  const auto isWithin = [](int64_t at, int64_t length) {
    return kSquareSide <= at && at <= length - kSquareSide;
  };
  const bool counts =
      mode != kNoSquare && isWithin(center->x, screenW) && isWithin(center->y, screenH);
  if (counts) {
    rect.x = center->x - kSquareSide / 2;
    rect.y = center->y - kSquareSide / 2;
  }
  rect.w = counts ? kSquareSide : 0;
  rect.h = rect.w;
}

void Screen::onTouchClickCount() {
  const int count = clicks.tap(GetTicks());
  if (count == 0) return setRect(kNoSquare, &rect);
  kLog.print(LogLevel::Debug, "onTouchClickCount!! %d", count);
  if (count == DoubleTap::kDouble) doubleClickCallback(0);
}

FullScreen::FullScreen(int color) : colorIndex(color) {
  setType(kTopLayer);
  setRect(color);
  Window::registerWidget(this);
}

FullScreen::~FullScreen() { leaveWindow(); }

int FullScreen::show() { return show(0); }

int FullScreen::show(unsigned int) {
  skia_add_box_c(read(fillRect));
  return 1;
}

int FullScreen::hide() {
  active = false;
  lcdState = 1;
  return 1;
}

void FullScreen::lcdOn(int on) { lcdState = on; }

void FullScreen::setRect(int color) {
  const ScreenSize screen = presentScreen();
  const std::lock_guard guard(stateLock);
  screenW = screen.w;
  screenH = screen.h;
  fillRect = overScreen(screen, fillOf(color));
}

}  // namespace MW
