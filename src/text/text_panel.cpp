#include <MW/c_api.h>
#include <MW/text_panel.h>
#include <brimol/input.h>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/redraw.h"

namespace MW {

TextPanel::TextPanel(const char* logWord) : word(logWord) { type_ = kBaseLayer; }

void TextPanel::takeLooks(const SKIA_Rect* area, const SKIA_Text* looks) {
  const SKIA_Rect place = area != nullptr ? *area : SKIA_Rect{};
  {
    const std::lock_guard guard(stateLock);
    rect.color = saved_bg_color = place.color;
    text = copyText(looks);
  }
  setRect(0, &place);
}

int TextPanel::show() { return show(0); }

// The time is never taken back, so that every later pass asks, too. Once reached it goes along with
// the clock, or a turn of that later it would lie ahead again.
void TextPanel::updateTimer(unsigned int ticks) {
  {
    const std::lock_guard guard(stateLock);
    if (!showTimer.isDue(ticks)) return;
    showTimer.start(ticks, 0);
  }
  isDisplayUpdate_c(1);
}

int TextPanel::hide() {
  setActive(0);
  return 1;
}

bool TextPanel::follows(const event_data* event) const {
  if (event == nullptr || read(showTimer).isPending()) return false;
  return hold.isHeld() || isUnder(rect, event);
}

char* TextPanel::getText() { return text.text; }
unsigned int TextPanel::getBgColor() { return read(rect.color); }
unsigned int TextPanel::getTextColor() { return read(text.color); }
int TextPanel::getFontSize() { return read(text.size); }
SKIA_Rect* TextPanel::getPositionAndSize() { return &rect; }
void TextPanel::setFontSize(int pixels) { write(text.size, pixels); }
void TextPanel::setTextColor(unsigned int color) { write(text.color, color); }
void TextPanel::setBgColor(unsigned int color) { write(rect.color, color); }

void TextPanel::onShowTimer(int ms) {
  const unsigned int now = GetTicks();
  setActive(1);
  {
    const std::lock_guard guard(stateLock);
    showTimer.start(now, ms);
  }
  askForRedraw();
}

void TextPanel::restoreColor() {
  {
    const std::lock_guard guard(stateLock);
    if (rect.color == saved_bg_color) return;
    rect.color = saved_bg_color;
  }
  askForRedraw();
}

TextTouch TextPanel::takePress(const event_data& event) {
  ClassLog(word).print(LogLevel::Debug, "pressed!!");
  hold.press(event.mouse);
  return TextTouch::Press;
}

TextTouch TextPanel::takeRelease(const event_data* event) {
  hold.letGo();
  return isUnder(rect, event) ? TextTouch::Release : TextTouch::None;
}

TextTouch TextPanel::takeLongPress() const {
  ClassLog(word).print(LogLevel::Debug, "long pressed!!");
  return TextTouch::LongPress;
}

TextTouch TextPanel::takeTap() {
  const TextTouch what = gesture.tap(GetTicks());
  const int number = gesture.tapNumber();
  if (number != 0) ClassLog(word).print(LogLevel::Debug, "onTouchClickCount!! %d", number);
  return what;
}

}  // namespace MW
