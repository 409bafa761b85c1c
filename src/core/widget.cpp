#include <MW/detail/clock_order.h>
#include <MW/widget.h>

#include "core/hit_test.h"
#include "core/layer_walk.h"
#include "core/layers.h"
#include "core/life_guard.h"
#include "core/pass_time.h"

namespace MW {

namespace {
constexpr unsigned int kBlinkMs = 500;
}  // namespace

Widget::Widget() = default;

Widget::~Widget() {
  leaveLayers();
  LayerWalk::forget(this);
  LifeGuard::widgetEnds(this);
}

void Widget::leaveLayers() { Layers::leave(*this, Layers::Count::Kept); }
void Widget::leaveWindow() { Layers::leave(*this, Layers::Count::Lowered); }

bool Widget::isUnder(const SKIA_Rect& field, const event_data* event) const {
  return event != nullptr && isPointerEvent(*event) && contains(read(field), positionOf(*event));
}

int Widget::show() { return 0; }
int Widget::show(unsigned int) { return 0; }
void Widget::updateTimer(unsigned int) {}
int Widget::hide() { return 0; }
bool Widget::onRecvEvent(event_data*, unsigned int) { return false; }
char* Widget::getText() { return nullptr; }
unsigned int Widget::getBgColor() { return 0; }
unsigned int Widget::getTextColor() { return 0; }
int Widget::getFontSize() { return 0; }
SKIA_Rect* Widget::getPositionAndSize() { return nullptr; }
void Widget::setFontSize(int) {}
void Widget::setText(const char*) {}
void Widget::setTextAlign(int) {}
void Widget::setTextColor(unsigned int) {}
void Widget::setBgColor(unsigned int) {}
void Widget::setBdColor(unsigned int) {}
void Widget::setLnColor(unsigned int) {}
void Widget::onShowTimer(int) {}
int Widget::add_MWWList() { return 0; }
void Widget::lcdOn(int) {}
void Widget::onHideTimer(int) {}
void Widget::onHover(event_data*) {}
void Widget::onPress(event_data*) {}
void Widget::onRelease(event_data*) {}
void Widget::onPressLong(event_data*) {}
void Widget::setRect(int, const SKIA_Rect*) {}
void Widget::setMsg(const char*) {}
void Widget::onTouchClickCount() {}
int Widget::setTimer(int) { return 0; }
void Widget::onPressKey(kbd_event*) {}
void Widget::onReleaseKey(kbd_event*) {}
void Widget::onPlugKey(kbd_event) {}
void Widget::onPressTouch(mouse_event) {}
void Widget::onReleaseTouch(mouse_event) {}
void Widget::onProgressbar(int) {}
void Widget::restoreColor() {}
void Widget::Lock() {}
void Widget::unLock() {}
void Widget::setDesc(const char*, const char*, const char*, int) {}
void Widget::setbutton(const char*, const char*) {}

void Widget::setActive(int on) {
  if (on == 0) select = 0;
  active = on != 0;
}

unsigned int Widget::setBlink(int on, unsigned int color) {
  const std::lock_guard guard(stateLock);
  blink = on != 0 ? 1 : 0;
  if (blink == 0) return 0;
  blinkRuns = false;
  blinkCount = 0;
  blinkColor = color;
  return color;
}

unsigned int Widget::updateBlink(unsigned int now) {
  if (blink == 0) return kColorBlack;
  if (!blinkRuns) blinkNext = now + kBlinkMs;
  blinkRuns = true;
  // Counted from the tick that notices the end of a phase, not from the one that was planned.
  if (hasEnded(now, blinkNext, kBlinkMs)) {
    blinkNext = now + kBlinkMs;
    ++blinkCount;
  }
  return blinkCount % 2 != 0 ? blinkColor : kColorBlack;
}

int Widget::move_key_select(int key, int canLeft, int canRight) {
  if (key == kKeyLeft && canLeft != 0) keyDir = kLeftSide;
  if (key == kKeyRight && canRight != 0) keyDir = kRightSide;
  return key == kKeySelect && (canLeft != 0 || canRight != 0) ? 1 : 0;
}

}  // namespace MW
