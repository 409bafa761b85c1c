#include <MW/dialog_new.h>
#include <MW/window.h>

#include <utility>

#include "core/bounded_text.h"
#include "dialogs/dialog_parts.h"

namespace MW {

namespace {

constexpr int kFewRows = 2;  // of the frame without buttons
constexpr int kAllRows = 3;
constexpr int kSingleLineParts = 3;  // of the body's height, of which one line takes one
constexpr int64_t kFaceGap = 5;      // pixels

// The box of the body that holds the lines is divided evenly.
struct LineGrid {
  int64_t pitch;
  int64_t gap;
  int64_t size;  // of the letters
};

constexpr LineGrid divideBody(int64_t bodyHeight, int last) {
  const int64_t pitch = bodyHeight / (last + 2);
  return {pitch, pitch / (last + 2), last == 0 ? bodyHeight / kSingleLineParts : pitch};
}
static_assert(divideBody(228, 0).pitch == 114 && divideBody(228, 0).gap == 57);
static_assert(divideBody(228, 0).size == 76 && divideBody(228, 2).size == 57);

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
  if (buttonMode == kProgressRow) drawProgress(ticks);
  if (buttonMode == kOneButton || buttonMode == kTwoButtons) drawButton(button1);
  if (buttonMode == kTwoButtons) drawButton(button2);
  return 1;
}

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
  if (buttonMode == kNoButtons) return;
  const int buttons = buttonMode == kTwoButtons ? 2 : 1;
  placeButton(button1, grid, faceOf(0, buttons, grid));
  if (buttons == 2) placeButton(button2, grid, faceOf(1, buttons, grid));
}

void DialogNew::layOutLines() {
  if (lineCount() == 0) return;
  const SKIA_Rect& body = frame.body;
  const auto [pitch, gap, size] = divideBody(body.h, descLast);
  int64_t top = body.y + gap;
  for (std::size_t i = 0; i < lineCount(); ++i) {
    descRects.at(i) = makeRect(body.x + gap, top, body.w - 2 * gap, pitch, 0);
    descs.at(i).color = kColorWhite;
    descs.at(i).size = toPixels(size);
    top += pitch + gap;
  }
}

std::size_t DialogNew::lineCount() const {
  return descLast == kNoLines ? 0 : static_cast<std::size_t>(descLast) + 1;
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
