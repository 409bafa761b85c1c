#include <MW/dialog_new.h>
#include <MW/window.h>

#include <utility>

#include "core/bounded_text.h"
#include "dialogs/dialog_parts.h"

namespace MW {

namespace {

constexpr int kFewRows = 2;  // of the frame without buttons
constexpr int kAllRows = 3;
constexpr int kSingleLineParts = 3;  // of the body's height; a single line takes one of them
constexpr int64_t kFaceGap = 5;      // pixels

// How the lines divide the body's height.
struct LineGrid {
  int64_t pitch;
  int64_t gap;
  int64_t size;  // of the letters
};

constexpr LineGrid divideBody(int64_t bodyHeight, std::size_t lines) {
  const auto parts = static_cast<int64_t>(lines + 1);
  const int64_t pitch = bodyHeight / parts;
  return {pitch, pitch / parts, lines == 1 ? bodyHeight / kSingleLineParts : pitch};
}
static_assert(divideBody(228, 1).pitch == 114 && divideBody(228, 1).gap == 57);
static_assert(divideBody(228, 1).size == 76 && divideBody(228, 3).size == 57);

SKIA_Rect faceOf(int button, int buttons, const DialogGrid& grid) {
  const int64_t w = (grid.w - (kFaceGap * (buttons - 1) + 2 * kFaceGap)) / buttons;
  return makeRect(grid.x + w * button + kFaceGap * (button + 1),
                  grid.y + grid.row + grid.body + kFaceGap, w, grid.row - 2 * kFaceGap,
                  kColorWhite);
}

}  // namespace

DialogNew::DialogNew(const char* title, int align, int color, int size)
    : PromptDialog("DIALOGNEW") {
  DialogNew_init();
  if (title != nullptr) {
    putText(frame.title, boundedText(title));
    frame.title.align = align;
    frame.title.color = static_cast<uint32_t>(color);
    frame.title.size = size;
  }
  setRect();
  Window::registerWidget(this);
}

DialogNew::DialogNew(const char* title, int align, int color) : DialogNew(title, align, color, 0) {}

DialogNew::~DialogNew() { leaveWindow(); }

void DialogNew::DialogNew_init() {
  startOver();
  plugCallback = hookKeyCallback = nullptr;
  const std::lock_guard guard(stateLock);
  progress.restart(0);
  frame.title.string_len = 0;
  frame.title.size = 0;
  descBlink = 1;
  descBgColor = kColorBlack;
  descLast = kNoLines;
  buttonMode = kNoButtons;
  for (SKIA_Text& line : descs) line.string_len = 0;
  emptyButtons();
}

void DialogNew::emptyButtons() {
  for (DialogButton* const button : {&button1, &button2}) {
    button->enabled = 0;
    button->caption.string_len = 0;
  }
}

int DialogNew::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (descBlink == 1) frame.body.color = updateBlink(ticks);
  drawFrame(frame);
  for (std::size_t i = 0; i < lineCount(); ++i) skia_add_label_c(descRects.at(i), descs.at(i));
  switch (buttonMode) {
    case kProgressRow: drawProgress(ticks); break;
    case kOneButton: drawButton(button1); break;
    case kTwoButtons:
      drawButton(button1);
      drawButton(button2);
      break;
    default: break;
  }
  return 1;
}

bool DialogNew::onRecvEvent(event_data* event, unsigned int arg) {
  if (event == nullptr || event->type != kEventKeyPress) {
    return PromptDialog::onRecvEvent(event, arg);
  }
  onPressKey(event->key);
  return true;
}

void DialogNew::onPressKey(kbd_event key) { pressKey(key, read(buttonMode)); }

void DialogNew::setRect() {
  const std::lock_guard guard(stateLock);
  layOut();
}

void DialogNew::layOut() {
  const ScreenSize screen = presentScreen();
  const DialogGrid grid = layOutGrid(screen, buttonMode == kNoButtons ? kFewRows : kAllRows);
  layOutFrame(frame, screen, grid);
  frame.body.color = descBgColor;
  if (frame.title.size == 0) frame.title.size = kDialogTitleSize;
  layOutLines();
  btnNormalColor = kColorWhite;
  layOutButtons(grid);
}

void DialogNew::layOutButtons(const DialogGrid& grid) {
  switch (buttonMode) {
    case kOneButton:
    case kProgressRow: placeButton(button1, grid, faceOf(0, 1, grid)); break;
    case kTwoButtons:
      placeButton(button1, grid, faceOf(0, 2, grid));
      placeButton(button2, grid, faceOf(1, 2, grid));
      break;
    default: break;
  }
}

void DialogNew::layOutLines() {
  const SKIA_Rect& body = frame.body;
  const auto [pitch, gap, size] = divideBody(body.h, lineCount());
  int64_t top = body.y + gap;
  for (std::size_t i = 0; i < lineCount(); ++i) {
    descRects.at(i) = makeRect(body.x + gap, top, body.w - 2 * gap, pitch, 0);
    descs.at(i).color = kColorWhite;
    descs.at(i).size = toPixels(size);
    top += pitch + gap;
  }
}

std::size_t DialogNew::lineCount() const {
  const bool hasLines = descLast >= 0 && descLast < kLines;
  return hasLines ? static_cast<std::size_t>(descLast) + 1 : 0;
}

void DialogNew::setDesc(const char* line1, const char* line2, const char* line3, int align) {
  const std::lock_guard guard(stateLock);
  descLast = kNoLines;
  for (SKIA_Text& line : descs) line.string_len = 0;
  for (const char* const words : {line1, line2, line3}) {
    if (words == nullptr) break;
    descLast = descLast == kNoLines ? 0 : descLast + 1;
    SKIA_Text& line = descs.at(static_cast<std::size_t>(descLast));
    putText(line, boundedText(words));
    line.align = align;
  }
  layOut();
}

void DialogNew::setDesc(const char* line1, const char* line2, const char* line3) {
  setDesc(line1, line2, line3, SKIA_ALIGN_LEFT);
}

void DialogNew::setbutton(const char* caption1, const char* caption2) {
  const std::lock_guard guard(stateLock);
  buttonMode = kNoButtons;
  emptyButtons();
  int number = 0;
  for (const auto& [button, words] : {std::pair(&button1, caption1), {&button2, caption2}}) {
    if (words == nullptr) break;
    putText(button->caption, boundedText(words));
    button->enabled = 1;
    buttonMode = number++;
  }
  layOut();
}

void DialogNew::setProgress(unsigned int) {
  const std::lock_guard guard(stateLock);
  button1.enabled = 0;
  button2.enabled = 0;
  buttonMode = kProgressRow;
  layOut();
}

void DialogNew::setBackGroundColor(unsigned int color) { write(frame.backdrop.color, color); }
void DialogNew::setDescColor(unsigned int color) { write(descBgColor, color); }
void DialogNew::setDescBlink(int on) { write(descBlink, on); }

}  // namespace MW
