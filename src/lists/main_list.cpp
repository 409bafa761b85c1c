#include <MW/main_list.h>
#include <MW/window.h>

#include <algorithm>
#include <cstring>
#include <utility>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"
#include "core/life_guard.h"
#include "core/present_screen.h"
#include "lists/main_list_tables.h"
#include "lists/row_column.h"

namespace MW {

namespace {

constexpr ClassLog kLog("MAINLIST");
constexpr int kItemGap = 3;  // pixels
constexpr int kNoItem = -1;
constexpr int kLongestText = kTextMax - 1;  // bytes

bool isText(const char* given, int64_t length) {
  return given != nullptr && length >= 1 && length <= kLongestText;
}

}  // namespace

MainList::MainList(const char* listTitle, int listMode) : RowList("MAINLIST", listTitle) {
  kLog.print(LogLevel::Debug, "call registerWidget");
  init_MainList(listMode);
}

MainList::MainList(const char* listTitle) : MainList(listTitle, kPlain) {}

MainList::~MainList() { leaveWindow(); }

void MainList::init_MainList(int listMode) {
  setRect(listMode);
  setActive(0);
  setType(kBaseLayer);
  initIndex();
  {
    const std::lock_guard guard(stateLock);
    mode = listMode;
    click.press(ClickSlop::kNone);
    scroll = 0;
    finished = 0;
    shown = 0;
    current = kNoItem;
  }
  clickCallback = pressCallback = releaseCallback = scrollCallback = nullptr;
  keyPressCallback = keyReleaseCallback = nullptr;
  Window::registerWidget(this);
}

void MainList::setRect(int listMode) {
  const ScreenSize screen = presentScreen();
  const int titleHeight = listMode == kExtended ? kExtendedTitleHeight : kTitleHeight;
  const std::lock_guard guard(stateLock);
  screenRect = {0, 0, screen.w, screen.h, 0};
  titleBar = {0, 0, screen.w, titleHeight, kColorBlack};
  titleRect = {0, 0, screen.w, kTitleHeight, kColorBlack};
  listRect = makeRect(0, titleHeight, screen.w, int64_t{screen.h} - titleHeight, 0);
  bottomEdge = footLine(screen.w, screen.h);
  touchSlop = clickSlop(screen.w);
  for (std::size_t i = 0; i < option.size(); ++i) {
    const StatusRow& row = kStatusRows.at(i);
    option.at(i).rect = statusRect(row, screen.w);
    option.at(i).text = makeText(row.initial, kStatusColor, row.align, kStatusSize);
  }
}

void MainList::initIndex() {
  const std::lock_guard guard(stateLock);
  items.fill({});
  count = 0;
}

int MainList::addIndex(int kind, const SKIA_Text* item, int height) {
  if (item == nullptr || strnlen(item->text, SKIA_TEXT_BYTES) > kLongestText) return kNoItem;
  const std::lock_guard guard(stateLock);
  if (count == kItems || finished != 0) return kNoItem;
  const ItemColors& colors = colorsOf(kind);
  Item& added = items.at(static_cast<std::size_t>(count));
  added = {kind, height, colors.background, copyText(item)};
  added.text.color = colors.text;
  return count++;
}

void MainList::initFinish() {
  int first = kNoItem;
  {
    const std::lock_guard guard(stateLock);
    finished = 1;
    first = nextSelectable(kNoItem, 1);
    current = first;
  }
  kLog.print(LogLevel::Debug, "initFinish find first item #%02d ", first);
}

int MainList::Max_height() {
  const std::lock_guard guard(stateLock);
  return toPixels(wholeColumn().height());
}

// The first items, where the list has scrolled them.
RowColumn MainList::columnOf(int itemCount) const {
  RowColumn column(int64_t{listRect.y} + scroll, kItemGap);
  for (int i = 0; i < itemCount; ++i) column.add(items.at(static_cast<std::size_t>(i)).height);
  return column;
}

// Those that the list's height counts: it goes on behind an end that was set between items.
RowColumn MainList::wholeColumn() const {
  RowColumn column(listRect.y, kItemGap);
  for (const Item& item : items) {
    if (item.kind != kEnd) column.add(item.height);
  }
  return column;
}

int MainList::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  if (finished == 0) return 1;
  drawItems();
  skia_add_box_c(titleBar);
  skia_add_label_c(titleRect, title);
  drawStatus();
  skia_add_box_c(bottomEdge);
  if (shown == 0) {
    shown = 1;
    kLog.print(LogLevel::Debug, "SHOW->%s", title.text);
  }
  return 1;
}

void MainList::drawItems() const {
  const int64_t bottom = int64_t{listRect.y} + listRect.h;
  RowColumn column = columnOf(0);
  for (const Item& item : items) {
    if (item.kind == kEnd) return;
    const int64_t y = column.add(item.height).top;
    if (!isBetween(listRect.y, y, bottom)) continue;
    skia_add_textbox_c(makeRect(0, y, screenRect.w, item.height, item.bgColor), item.text);
  }
}

void MainList::drawStatus() const {
  const auto draw = [this](MainList::StatusText number) {
    const Option& shownText = option.at(number);
    skia_add_label_c(shownText.rect, shownText.text);
  };
  std::ranges::for_each(kAlwaysDrawn, draw);
  if (mode == kExtended) std::ranges::for_each(kExtendedDrawn, draw);
}

int MainList::hide() {
  setActive(0);
  const bool wasShown = [this] {
    const std::lock_guard guard(stateLock);
    return std::exchange(shown, 0) == 1;
  }();
  if (wasShown) kLog.print(LogLevel::Debug, "HIDE<-%s", title.text);
  return 0;
}

template <typename Change>
void MainList::changeItem(int item, Change change) {
  const std::lock_guard guard(stateLock);
  if (item >= 0 && item < count) change(items.at(static_cast<std::size_t>(item)));
}

void MainList::setText(int item, const char* newText, unsigned int length) {
  if (!isText(newText, length)) return;
  changeItem(item, [&](Item& changed) { putTextOpen(changed.text, boundedText(newText, length)); });
}

void MainList::setFontSize(int item, int pixels) {
  changeItem(item, [&](Item& changed) { changed.text.size = pixels; });
}

void MainList::setTextColor(int item, unsigned int color) {
  changeItem(item, [&](Item& changed) { changed.text.color = color; });
}

void MainList::setBGColor(int item, unsigned int color) {
  changeItem(item, [&](Item& changed) { changed.bgColor = color; });
}

void MainList::setListType(int item, int kind) {
  changeItem(item, [&](Item& changed) { changed.kind = kind; });
}

void MainList::setTextOption(int number, const char* newText, int length) {
  if (!isText(newText, length) || number < 0 || number >= kOptions) return;
  const std::lock_guard guard(stateLock);
  putText(option.at(static_cast<std::size_t>(number)).text,
          boundedText(newText, static_cast<std::size_t>(length)));
}

void MainList::setTextBattery(const char* newText, int length) {
  setTextOption(kBattery, newText, length);
}

void MainList::setTextTa(const char* newText, int length) {
  setTextOption(kCharger, newText, length);
}

void MainList::setTextBrightness(const char* newText, int length) {
  setTextOption(kBrightness, newText, length);
}

void MainList::setTitleBGColor(int) {}

bool MainList::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  switch (event->type) {
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    default: break;
  }
  if (!takesTouch(*event, listRect, kEventRelease)) return false;
  switch (event->type) {
    case kEventMotion: onHover(event->mouse); return true;
    case kEventPress: onPress(event->mouse); return true;
    case kEventRelease: onRelease(event->mouse); return true;
    default: return false;
  }
}

void MainList::onPressKey(kbd_event key) {
  logKeyPress(key);
  if (auto* const call = keyPressCallback) call(&key, this);
}

void MainList::onReleaseKey(kbd_event key) {
  logKeyRelease(key);
  if (auto* const call = keyReleaseCallback) call(&key, this);
}

void MainList::onPress(mouse_event mouse) {
  hold.press(mouse);
  pressRow(position2index(mouse));
  if (auto* const call = pressCallback) call(&mouse, this);
}

void MainList::onRelease(mouse_event mouse) {
  hold.letGo();
  const int item = position2index(mouse);
  const LifeGuard self(this);
  if (isClicked(item)) {
    if (auto* const call = clickCallback) call(&mouse, this);
  }
  if (!self.isAlive()) return;
  if (auto* const call = releaseCallback) call(&mouse, this);
}

bool MainList::isClicked(int item) const {
  const std::lock_guard guard(stateLock);
  return item >= 0 && item == click.row() &&
         items.at(static_cast<std::size_t>(item)).kind == kSelectable;
}

void MainList::onHover(mouse_event mouse) {
  inClick(mouse.xrel, mouse.yrel);
  {
    const std::lock_guard guard(stateLock);
    const RowColumn column = wholeColumn();
    if (column.height() < int64_t{screenRect.h} - titleBar.h) return;  // all of it is in view
    scroll = toPixels(column.clampScroll(int64_t{scroll} + mouse.yrel, listRect.h));
  }
  if (auto* const call = scrollCallback) call(&mouse, this);
}

void MainList::inClick(int dx, int dy) {
  const std::lock_guard guard(stateLock);
  click.move(dx, dy, touchSlop);
}

// Asks copies, so that drawing need not wait for the log.
int MainList::position2index(mouse_event mouse) {
  auto [column, asked] = [this] {
    const std::lock_guard guard(stateLock);
    return std::pair(columnOf(0), items);
  }();
  int number = 0;
  for (const Item& item : asked) {
    if (item.kind == kEnd) return kNoItem;
    const RowPlace row = column.add(item.height);
    logHit(row.top, mouse, row.bottom);
    if (row.isAt(mouse.y)) return number;
    ++number;
  }
  return ClickSlop::kNone;
}

int MainList::move_key_down(int) {
  const std::lock_guard guard(stateLock);
  const int next = nextSelectable(current, 1);
  if (next == kNoItem) return kNotMoved;
  current = next;
  const int64_t below = columnOf(next + 1).nextTop() - listRect.y - listRect.h;
  scroll = toPixels(scroll - std::max<int64_t>(below, 0));
  return next;
}

int MainList::move_key_up(int) {
  const std::lock_guard guard(stateLock);
  const int previous = nextSelectable(current, -1);
  if (previous != kNoItem) current = previous;
  if (current == kNoItem) return kNotMoved;
  // Also where it is the first one, which may have been scrolled out of sight.
  const int64_t above = listRect.y - columnOf(current).nextTop();
  scroll = toPixels(scroll + std::max<int64_t>(above, 0));
  return previous == kNoItem ? kNotMoved : previous;
}

// The first selectable item beyond `from` in the direction of `step`, or kNoItem.
int MainList::nextSelectable(int from, int step) const {
  for (int i = from + step; i >= 0 && i < count; i += step) {
    if (items.at(static_cast<std::size_t>(i)).kind == kSelectable) return i;
  }
  return kNoItem;
}

}  // namespace MW
