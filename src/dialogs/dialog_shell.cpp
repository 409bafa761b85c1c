#include <MW/dialog_shell.h>
#include <MW/window.h>

#include <algorithm>
#include <span>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/hit_test.h"
#include "dialogs/dialog_parts.h"

namespace MW {

namespace {
constexpr const char* kWord = "DIALOGSHELL";
constexpr ClassLog kLog(kWord);
constexpr int64_t kLineMargin = 25;   // pixels
constexpr int kLineTextPercent = 85;  // of the lines' pitch
}  // namespace

DialogShell::DialogShell(const char* title) : DialogShell(title, kLines) {}

DialogShell::DialogShell(const char* title, int lineCount) : FramedDialog(kWord) {
  kLog.print(LogLevel::Debug, "call registerWidget");
  maxLines = std::clamp(lineCount, 1, kLines);
  init_DialogShell(title);
}

DialogShell::~DialogShell() { leaveWindow(); }

void DialogShell::init_DialogShell(const char* title) {
  setActive(0);
  write(twoButtons, 0);
  setRect_static();
  initShell();
  startOver();
  {
    const std::lock_guard guard(stateLock);
    putText(frame.title, boundedText(title));
    putText(button1.caption, "OK");
    putText(button2.caption, "CANCEL");
    button1.enabled = 1;
  }
  Window::registerWidget(this);
}

void DialogShell::initShell() {
  const std::lock_guard guard(stateLock);
  order.fill(kNoLine);
  acceptLines = 1;
}

int DialogShell::addShell(const char* line) {
  const auto given = wholeText(line, kLongestLine);
  int slot = kNoLine;
  {
    const std::lock_guard guard(stateLock);
    if (!given || acceptLines == 0) return kNoLine;
    slot = takeSlot();
    putText(lines.at(static_cast<std::size_t>(slot)), *given);
  }
  kLog.print(LogLevel::Debug, "addShell index = %d", slot);
  return slot;
}

// A new line takes the first free place, or the slot of the top line, which goes.
int DialogShell::takeSlot() {
  const auto places = std::span(order).first(static_cast<std::size_t>(maxLines));
  const auto free = std::ranges::find(places, kNoLine);
  if (free != places.end()) return *free = static_cast<int>(free - places.begin());
  std::rotate(places.begin(), places.begin() + 1, places.end());
  return places.back();
}

void DialogShell::setRect_static() {
  const ScreenSize screen = presentScreen();
  const std::lock_guard guard(stateLock);
  const int64_t pitch = (shorterSide(screen) - 2 * rowHeight(screen)) / maxLines;
  const DialogGrid grid = layOutAround(screen, pitch * maxLines, 2);
  layOutFrame(frame, screen, grid);
  styleTitle(frame.title, SKIA_ALIGN_CENTRE);
  int64_t top = frame.body.y;
  for (SKIA_Rect& place : lineRects) {
    place = makeRect(frame.body.x + kLineMargin, top, frame.body.w - 2 * kLineMargin, pitch - 1, 0);
    top += pitch - 1;
  }
  for (SKIA_Text& line : lines) {
    line.color = kColorWhite;
    line.align = SKIA_ALIGN_LEFT;
    line.size = toPixels(percentOf(pitch, kLineTextPercent));
  }
  button2 = {.caption = button2.caption, .enabled = twoButtons};
  if (twoButtons != 0) placeButton(button2, grid, rightFace(grid));
  placeButton(button1, grid, twoButtons != 0 ? leftFace(grid) : wideFace(grid));
  btnNormalColor = kColorWhite;
}

int DialogShell::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (acceptLines == 0) return 1;
  frame.body.color = updateBlink(ticks);
  drawFrame(frame);
  for (std::size_t i = 0; i < static_cast<std::size_t>(maxLines); ++i) {
    if (order.at(i) == kNoLine) continue;
    const SKIA_Text& line = lines.at(static_cast<std::size_t>(order.at(i)));
    if (line.string_len != 0) skia_add_textbox_c(lineRects.at(i), line);
  }
  drawButton(button1);
  drawButton(button2);  // of no size while there is one button
  return 1;
}

bool DialogShell::onRecvEvent(event_data* event, unsigned int arg) {
  if (event == nullptr) return false;
  const bool mayAnswer = event->type == kEventRelease || !isPointerEvent(*event);
  if (!mayAnswer && hold.isOthers(event->mouse)) return false;
  if (event->type == kEventUser) return onPlugKey(event->key), true;
  return FramedDialog::onRecvEvent(event, arg);
}

}  // namespace MW
