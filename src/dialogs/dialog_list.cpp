#include <MW/dialog_list.h>
#include <MW/window.h>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/hit_test.h"
#include "core/life_guard.h"
#include "dialogs/dialog_parts.h"

namespace MW {

namespace {

constexpr const char* kWord = "DIALOGLIST";
constexpr ClassLog kLog(kWord);
constexpr int kFewestRows = 2;
constexpr int kNotAdded = -1;

constexpr int kBoxSide = 100;  // pixels, and so the rest
constexpr int kMarkInset = 2;
constexpr int kTextGap = 150;     // from the box's left to the text's
constexpr int kTextMargin = 200;  // by which the text is narrower than the body
constexpr int kRowTextSize = 75;

// Six rows fill what title and buttons leave of the screen's shorter side.
constexpr int64_t rowPitch(ScreenSize screen) {
  constexpr int kRowsThatFit = 6;
  const int64_t row = rowHeight(screen);
  return row == 0 ? 0 : row * (shorterSide(screen) / row - 2) / kRowsThatFit;
}
static_assert(rowPitch({1440, 2560}) == 153 && rowPitch({6, 6}) == 0);

SKIA_Rect markIn(const SKIA_Rect& box) {
  constexpr int kMarkSide = kBoxSide - 2 * kMarkInset;
  return makeRect(int64_t{box.x} + kMarkInset, int64_t{box.y} + kMarkInset, kMarkSide, kMarkSide,
                  kColorHighlight);
}

}  // namespace

DialogList::DialogList(const char* title) : FramedDialog(kWord) {
  answer1 = static_cast<Answer>(&DialogList::onBtn1Released);
  answer2 = static_cast<Answer>(&DialogList::onBtn2Released);
  followsMotionInTheDark = false;
  kLog.print(LogLevel::Debug, "call registerWidget");
  putText(frame.title, boundedText(title));
  putText(button1.caption, "CANCEL");
  putText(button2.caption, "OK");
  init_DialogList();
}

DialogList::~DialogList() { leaveWindow(); }

void DialogList::init_DialogList() {
  setActive(0);
  initIndex();
  startOver();
  rowPressCallback = nullptr;
  enable(1, 1, 1);
  Window::registerWidget(this);
}

void DialogList::initIndex() {
  const std::lock_guard guard(stateLock);
  selectedIndex = kNoRow;
  initFinished = 0;
  count = 0;
}

int DialogList::addIndex(const char* rowText) {
  const auto given = wholeText(rowText, kLongestLine);
  const std::lock_guard guard(stateLock);
  if (!given || count >= kRows || initFinished != 0) return kNotAdded;
  putText(rows.at(static_cast<std::size_t>(count)).text, *given);
  return count++;
}

// `index` may be one further than the last row.
void DialogList::setText(int index, const char* rowText) {
  const auto given = wholeText(rowText, kLongestLine);
  if (!given || given->empty()) return;
  const std::lock_guard guard(stateLock);
  if (index < 0 || index > count || index >= kRows) return;
  putText(rows.at(static_cast<std::size_t>(index)).text, *given);
}

int DialogList::initFinish(int index) {
  int total = 0;
  {
    const std::lock_guard guard(stateLock);
    layOut(count, index);
    initFinished = 1;
    total = count;
  }
  kLog.print(LogLevel::Debug, "initFinish - total = %d", total);
  return total;
}

void DialogList::setRect_static(int rowCount, int index) {
  const std::lock_guard guard(stateLock);
  layOut(rowCount, index);
}

void DialogList::layOut(int rowCount, int index) {
  const ScreenSize screen = presentScreen();
  const int64_t pitch = rowPitch(screen);
  const DialogGrid grid = layOutAround(screen, pitch * rowCount, 2);
  selectedIndex = index;
  committedIndex = index;
  if (rowCount < kFewestRows || rowCount > kRows) return;
  layOutFrame(frame, screen, grid);
  styleTitle(frame.title, SKIA_ALIGN_CENTRE);
  const int64_t margin = (pitch - kBoxSide) / 2;
  int64_t top = frame.body.y + margin;
  for (Row& row : rows) {
    row.box = makeRect(frame.body.x + margin, top, kBoxSide, kBoxSide, kColorWhite);
    row.area = makeRect(int64_t{row.box.x} + kTextGap, top, grid.w - 2 - kTextMargin, kBoxSide, 0);
    row.text.color = kColorWhite;
    row.text.align = SKIA_ALIGN_LEFT;
    row.text.size = kRowTextSize;
    top += pitch;
  }
  placeButton(button1, grid, leftFace(grid));
  placeButton(button2, grid, rightFace(grid));
  btnNormalColor = kColorWhite;
}

int DialogList::show(unsigned int ticks) {
  const std::lock_guard guard(stateLock);
  if (initFinished == 0) return 1;
  frame.body.color = updateBlink(ticks);
  drawFrame(frame);
  for (int i = 0; i < count; ++i) {
    const Row& row = rows.at(static_cast<std::size_t>(i));
    skia_add_box_c(row.box);
    skia_add_textbox_c(row.area, row.text);
    if (i == selectedIndex) skia_add_box_c(markIn(row.box));
  }
  drawButton(button1);
  drawButton(button2);
  return 1;
}

bool DialogList::onRecvEvent(event_data* event, unsigned int arg) {
  if (event == nullptr || (isPointerEvent(*event) && hold.isOthers(event->mouse))) return false;
  switch (event->type) {
    case kEventPress: return pressTarget(event);
    case kEventRelease: return releaseTarget(event);
    default: return FramedDialog::onRecvEvent(event, arg);
  }
}

bool DialogList::pressTarget(event_data* event) {
  const LifeGuard self(this);
  const DialogButton* const pressed = pressAt(event);
  if (pressed != nullptr) {
    enable(pressed == &button1 ? 1 : 0, pressed == &button2 ? 1 : 0, 0);
    return true;
  }
  if (!self.isAlive() || lcdOnFlag == 0 || !isOnRows(event)) return false;
  onListPress(event->mouse);
  if (self.isAlive()) enable(0, 0, 1);
  return true;
}

bool DialogList::releaseTarget(event_data* event) {
  if (!releaseButtons(event)) return true;
  enable(1, 1, 1);
  hold.letGo();
  onRelease(event);
  return true;
}

int DialogList::position2index(mouse_event mouse) {
  const int index = rowAt(mouse);
  if (index != kNoRow) {
    kLog.print(LogLevel::Debug, "position2index= [%04d,%04d], index = %d", mouse.x, mouse.y, index);
  }
  return index;
}

int DialogList::rowAt(const mouse_event& mouse) const {
  const std::lock_guard guard(stateLock);
  for (int i = 0; i < count; ++i) {
    const auto& [box, area, words] = rows.at(static_cast<std::size_t>(i));
    if (isBetween(box.x, mouse.x, int64_t{area.x} + area.w) &&
        isBetween(box.y, mouse.y, int64_t{area.y} + area.h)) {
      return i;
    }
  }
  return kNoRow;
}

void DialogList::onListPress(mouse_event mouse) {
  hold.press(mouse);
  int index = position2index(mouse);
  if (index == kNoRow) return;
  write(selectedIndex, index);
  rowPressCallback(&index);
}

void DialogList::onBtn1Released(mouse_event) {
  kLog.print(LogLevel::Debug, "btn1-CANCEL released!!");
  if (!button1Callback) return;
  int index = read(committedIndex);
  write(selectedIndex, index);
  button1Callback(&index);
}

void DialogList::onBtn2Released(mouse_event) {
  kLog.print(LogLevel::Debug, "btn2-OK released!!");
  hide();
  if (!button2Callback) return;
  int index = read(selectedIndex);
  write(committedIndex, index);
  button2Callback(&index);
}

bool DialogList::isOnRows(const event_data* event) const {
  return read(listEnabled) != 0 && isUnder(frame.body, event);
}

void DialogList::enable(int first, int second, int list) {
  const std::lock_guard guard(stateLock);
  button1.enabled = first;
  button2.enabled = second;
  listEnabled = list;
}

}  // namespace MW
