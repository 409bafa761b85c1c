#include <MW/dialog_select.h>
#include <MW/window.h>

#include "core/class_log.h"
#include "core/life_guard.h"
#include "dialogs/dialog_parts.h"
#include "dialogs/tell.h"

namespace MW {

namespace {

constexpr ClassLog kLog("BUTTON");
constexpr int kTextSize = 70;  // pixels
constexpr int kInsetPercent = 90;
constexpr int kPanelPercent = 80;
constexpr int kTitlePart = 10;  // of the panel's height
constexpr int kRowPart = 4;     // of the panel's height
constexpr int kFacePart = 4;    // of the panel's width
constexpr int kColumns = 2;

constexpr SKIA_Rect layOutPanel(ScreenSize screen) {
  return makeRect(screen.w - percentOf(screen.w, kInsetPercent),
                  screen.h - percentOf(screen.h, kInsetPercent), percentOf(screen.w, kPanelPercent),
                  percentOf(screen.h, kPanelPercent), kColorBlack);
}

// A square, whatever the panel's height.
constexpr SKIA_Rect layOutFace(const SKIA_Rect& panel, int index, uint32_t color) {
  const int side = panel.w / kFacePart;
  const bool isLeft = index % kColumns == 0;
  const int64_t x =
      isLeft ? int64_t{panel.x} + side / 2 : int64_t{panel.x} + panel.w - side / 2 - side;
  const int64_t row = index / kColumns + 1;
  return makeRect(x, panel.y + panel.h / kRowPart * row - side / 2, side, side, color);
}
static_assert(layOutPanel({1440, 2560}).x == 144 && layOutPanel({1440, 2560}).h == 2048);
static_assert(layOutFace({144, 256, 1152, 2048, 0}, 0, 0).x == 288);
static_assert(layOutFace({144, 256, 1152, 2048, 0}, 5, 0).x == 864);
static_assert(layOutFace({144, 256, 1152, 2048, 0}, 5, 0).y == 1648);

}  // namespace

DialogSelect::DialogSelect(unsigned int kind) : selectKind(kind) {
  setType(kTopLayer);
  style(title, kColorHighlight, SKIA_ALIGN_CENTRE, kTextSize);
  for (Choice& each : choices) {
    style(each.caption, kColorBlack, SKIA_ALIGN_CENTRE, kTextSize);
  }
  setRect(0, 0);
  Window::registerWidget(this);
}

DialogSelect::~DialogSelect() { leaveWindow(); }

int DialogSelect::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  skia_add_box_c(backdrop);
  skia_add_box_c(border);
  skia_add_box_c(titleStrip);
  skia_add_label_c(titleStrip, title);
  for (const Choice& each : choices) skia_add_roundbuttonbox_c(each.face, each.caption);
  return 1;
}

int DialogSelect::hide() {
  setActive(0);
  return 1;
}

bool DialogSelect::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  switch (event->type) {
    case kEventMotion: return hoverAt(event);
    case kEventPress: return pressAt(event);
    case kEventRelease: releaseAt(event); return false;
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    case kEventUser: onPlugKey(event->key); return true;
    default: return false;
  }
}

bool DialogSelect::hoverAt(event_data* event) {
  const LifeGuard self(this);
  onHover(event);
  if (!self.isAlive() || enabled == 0) return false;
  if (isOn(pressedChoice(), event)) return true;
  restoreFaces();
  select = 0;
  return false;
}

bool DialogSelect::pressAt(event_data* event) {
  const LifeGuard self(this);
  onPress(event);
  if (!self.isAlive() || enabled == 0) return false;
  for (unsigned int i = 0; i < kChoices; ++i) {
    if (!isOn(i, event)) continue;
    onBtnPressed(event->mouse, static_cast<int>(i));
    return true;
  }
  return false;
}

void DialogSelect::releaseAt(event_data* event) {
  const LifeGuard self(this);
  if (enabled != 0) {
    const unsigned int chosen = pressedChoice();
    if (isOn(chosen, event)) onBtnReleased(event->mouse, static_cast<int>(chosen));
    if (!self.isAlive()) return;
    restoreFaces();
  }
  onRelease(event);
}

void DialogSelect::lcdOn(int on) { enabled = on; }

void DialogSelect::onHover(event_data* event) { tell(hoverCallback, event); }
void DialogSelect::onPress(event_data* event) { tell(touchPressCallback, event); }

void DialogSelect::onRelease(event_data* event) {
  const LifeGuard self(this);
  tell(touchReleaseCallback, event);
  if (self.isAlive()) select = 0;
}

void DialogSelect::onPlugKey(kbd_event key) {
  kLog.print(LogLevel::Debug, "key onPlugKey sym = %d", static_cast<int>(key.code));
  plugCallback(&key);
}

void DialogSelect::setRect(int, int) {
  const ScreenSize screen = presentScreen();
  const SKIA_Rect panel = layOutPanel(screen);
  const std::lock_guard guard(stateLock);
  backdrop = overScreen(screen, kColorShadow);
  border = grown(panel, 1, kColorGrey);
  titleStrip = {panel.x, panel.y, panel.w, panel.h / kTitlePart, kColorBlack};
  int index = 0;
  for (Choice& each : choices) each.face = layOutFace(panel, index++, optionColor);
}

void DialogSelect::setTitle(const char* newTitle) {
  const std::lock_guard guard(stateLock);
  putText(title, boundedText(newTitle));
}

void DialogSelect::setText_str(unsigned int index, const char* caption) {
  if (index >= kChoices) return;
  const std::lock_guard guard(stateLock);
  putText(choices.at(index).caption, boundedText(caption));
}

void DialogSelect::onBtnPressed(mouse_event, int index) {
  const auto pressed = static_cast<unsigned int>(index);
  if (pressed >= kChoices) return;
  kLog.print(LogLevel::Debug, "onBtnPressed %d!!", index);
  write(choices.at(pressed).face.color, kColorHighlight);
  setSelect(index + 1);
}

void DialogSelect::onBtnReleased(mouse_event mouse, int index) {
  if (static_cast<unsigned int>(index) >= kChoices) return;
  kLog.print(LogLevel::Debug, "onBtnReleased!! %d ", index);
  select = 0;
  mouse.state = static_cast<uint32_t>(index + 1);
  tell(choiceCallback, mouse);
}

void DialogSelect::onPressKey(kbd_event key) {
  if (key.code == kKeyHook) {
    if (buttonType == kHookVariant) onHookKeyPressed();
    return;
  }
  kLog.print(LogLevel::Debug, "key pressed sym = %d", static_cast<int>(key.code));
  tell(keyPressCallback, key);
}

void DialogSelect::onReleaseKey(kbd_event key) const {
  kLog.print(LogLevel::Debug, "key onReleaseKey sym = %d", static_cast<int>(key.code));
  tell(keyReleaseCallback, key);
}

void DialogSelect::onHookKeyPressed() {
  kLog.print(LogLevel::Debug, "Hook key pressed!!");
  hookKeyCallback(0);
}

// One less than the selection, which anyone may have set to any number.
unsigned int DialogSelect::pressedChoice() const {
  return static_cast<unsigned int>(select.load()) - 1;
}

bool DialogSelect::isOn(unsigned int index, const event_data* event) const {
  return index < kChoices && isUnder(choices.at(index).face, event);
}

void DialogSelect::restoreFaces() {
  const std::lock_guard guard(stateLock);
  for (Choice& each : choices) each.face.color = optionColor;
}

}  // namespace MW
