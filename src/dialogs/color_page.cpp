#include <MW/c_api.h>
#include <MW/color_page.h>
#include <MW/detail/clock_order.h>
#include <brimol/input.h>

#include <algorithm>

#include "core/key_clicks.h"
#include "core/life_guard.h"
#include "dialogs/page_text.h"
#include "dialogs/tell.h"

namespace MW {

namespace {
constexpr const char* kInitialText = "ABC";
}  // namespace

ColorPage::ColorPage(unsigned int color) : bgColor(color) {
  setType(kTopLayer);
  for (TextBox& each : boxes) putText(each.text, kInitialText);
  setRect(0, 0);
}

int ColorPage::show() { return show(0); }

int ColorPage::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  skia_add_box_c(rect);
  for (unsigned int i = 0; i < textCount; ++i) {
    const TextBox& box = boxes.at(i);
    skia_add_textbox_c(box.area, box.text);
  }
  return 1;
}

void ColorPage::updateTimer(unsigned int ticks) {
  {
    const std::lock_guard guard(stateLock);
    const unsigned int due = keyClicks.time;
    if (due != timeReached && ticks < due && isLater(due, ticks)) return;
    timeReached = due;
  }
  if (timerOn != 0) isDisplayUpdate_c(1);
}

int ColorPage::hide() {
  setActive(0);
  return 1;
}

bool ColorPage::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  switch (event->type) {
    case kEventPress: onPressTouch(event->mouse); return false;
    case kEventRelease: onReleaseTouch(event->mouse); return false;
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    default: return false;
  }
}

void ColorPage::lcdOn(int on) { lcdOnFlag = on; }

void ColorPage::onPressTouch(mouse_event mouse) { tell(touchPressCallback, mouse); }

void ColorPage::onReleaseTouch(mouse_event mouse) { tell(touchReleaseCallback, mouse); }

void ColorPage::setRect(int, int) {
  const ScreenSize screen = presentScreen();
  const std::lock_guard guard(stateLock);
  rect = overScreen(screen, bgColor);
}

void ColorPage::setBg_title(unsigned int color) { write(bgColor, color); }

void ColorPage::setText(unsigned int index, SKIA_Rect area, SKIA_Text caption) {
  if (index >= kTexts || !pageText(caption.text)) return;
  const std::lock_guard guard(stateLock);
  boxes.at(index) = {area, copyText(&caption)};
  textCount = std::max(textCount, index + 1);
}

void ColorPage::onPressKey(kbd_event key) const { tell(keyPressCallback, key); }

void ColorPage::onReleaseKey(kbd_event key) {
  {
    const std::lock_guard guard(stateLock);
    keyClicks.follow(key, GetTicks());
  }
  const LifeGuard self(this);
  onKeyClickCount(key);
  if (self.isAlive()) tell(keyReleaseCallback, key);
}

void ColorPage::onKeyClickCount(kbd_event key) {
  const unsigned int now = GetTicks();
  lastTick = now;
  int count = 0;
  {
    const std::lock_guard guard(stateLock);
    count = keyClicks.click(key.code, now);
  }
  tellKeyClicks(*this, keyClicks, count);
}

SKIA_Text* ColorPage::textAt(unsigned int index) {
  return index < kTexts ? &boxes.at(index).text : nullptr;
}

}  // namespace MW
