#include <MW/mpd_wid.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <cstring>
#include <new>
#include <string>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"
#include "core/life_guard.h"
#include "core/present_screen.h"
#include "lists/mpd_lines.h"
#include "lists/mpd_wid_tables.h"
#include "lists/row_column.h"

namespace MW {

namespace {

constexpr ClassLog kLog("MPDWID");
constexpr int kRowHeight = 141;  // pixels, and so the rest
constexpr int kRowGap = 1;
constexpr int kDrawnAbove = 143;  // a row is drawn whose top lies by less above the list's
constexpr int kRowTextSize = 19;
constexpr int kEndRow = -1;  // the row that ends a hit test

// Parts of the screen's height.
constexpr int kAboveHeader = 13;
constexpr int kHeader = 7;

SKIA_Text rowText(std::string_view words) {
  return makeText(words, kColorBlack, SKIA_ALIGN_CENTRE, kRowTextSize);
}

bool isMarked(const SKIA_Text& text, const Marker& marker) {
  return std::strcmp(text.text, marker.words) == 0;
}

}  // namespace

MpdWid::MpdWid(const char* listTitle) : RowList("MPDWID", listTitle) {
  kLog.print(LogLevel::Debug, "MpdWid");
  init_MpdWid();
}

MpdWid::~MpdWid() {
  kLog.print(LogLevel::Debug, "~MpdWid");
  leaveWindow();
}

void MpdWid::init_MpdWid() {
  kLog.print(LogLevel::Debug, "init_MpdWid");
  setRect();
  setActive(1);
  setType(kBaseLayer);
  initIndex();
  setSelect(0);
  {
    const std::lock_guard guard(stateLock);
    click.press(ClickSlop::kNone);
    mpd_line = visible_count = 0;
  }
  taps.reset();
  click_cb = press_cb = release_cb = hover_cb = nullptr;
  key_press_cb = key_release_cb = nullptr;
  Window::registerWidget(this);
}

void MpdWid::setRect() {
  kLog.print(LogLevel::Debug, "setRect");
  const ScreenSize screen = presentScreen();
  const int64_t width = int64_t{screen.w} - int64_t{2} * kMargin;
  const int headerTop = screen.h / kAboveHeader;
  const int headerHeight = screen.h / kHeader;
  const int64_t top = int64_t{headerTop} + headerHeight;
  const std::lock_guard guard(stateLock);
  bottom_line = footLine(screen.w, screen.h);
  touch_slop = clickSlop(screen.w);
  rect = {0, 0, screen.w, screen.h, rect.color};
  header_box = makeRect(kMargin, headerTop, width, headerHeight, kColorWhite);
  list_rect = makeRect(kMargin, top, width, screen.h - top, 0);
  cell = layOutCells(screen.w);
}

void MpdWid::initIndex() {
  kLog.print(LogLevel::Debug, "initIndex");
  const std::lock_guard guard(stateLock);
  scroll_y = list_rect.y;
}

void MpdWid::cal_line(const char* lines, int length) try {
  kLog.print(LogLevel::Debug, "cal_line");
  std::vector<MpdLine> parsed = parseMpdLines(mpdText(lines, length));
  const std::lock_guard guard(stateLock);
  mpd_buf.swap(parsed);
  mpd_line = static_cast<int>(mpd_buf.size());
  kLog.print(LogLevel::Debug, "mpd_line : %d", mpd_line);
  for (int i = 0; i < mpd_line; ++i) {
    const MpdLine& line = mpd_buf.at(static_cast<std::size_t>(i));
    if (i + 1 < mpd_line) {
      kLog.print(LogLevel::Debug, "mpd_buf[%d].details : %s", i, line.details ? "true" : "false");
    }
    fillItem(i, line);
  }
} catch (const std::bad_alloc&) {
  kLog.print(LogLevel::Error, "cal_line: no memory");
}

// NOLINTNEXTLINE(readability-function-size): applications call it with these arguments
void MpdWid::addIndex(int index, bool details, int level, const char* head, const char* name,
                      const char* value) {
  MpdLine line = {details, level, {}, {}, {}};
  putField(line.head, boundedText(head));
  putField(line.name, boundedText(name));
  putField(line.value, boundedText(value));
  const std::lock_guard guard(stateLock);
  fillItem(index, line);
}

void MpdWid::fillItem(int index, const MpdLine& line) {
  kLog.print(LogLevel::Debug, "addIndex, index : %d", index);
  if (index < 0 || index >= kItems) return;
  Item& filled = item.at(static_cast<std::size_t>(index));
  const auto* const row = std::ranges::find(kLevelColors, line.level, &LevelColor::level);
  if (row != kLevelColors.end()) filled.color = row->color;
  filled.listType = kRow;
  filled.height = kRowHeight;
  filled.level = line.level;
  filled.marker = rowText((line.details ? kCollapsed : kLeaf).words);
  filled.levelText = rowText('[' + std::to_string(line.level) + ']');
  filled.head = rowText(boundedText(line.head.data()));
  filled.name = rowText(boundedText(line.name.data()));
  filled.value = rowText(boundedText(line.value.data()));
}

void MpdWid::init_mpd_buf() {
  std::vector<MpdLine> freed;
  const std::lock_guard guard(stateLock);
  mpd_buf.swap(freed);
}

void MpdWid::setBGColor(int index, unsigned int color) {
  const std::lock_guard guard(stateLock);
  if (index >= 0 && index < mpd_line) item.at(static_cast<std::size_t>(index)).color = color;
}

void MpdWid::setListType(int index, int listType) {
  const std::lock_guard guard(stateLock);
  if (index >= 0 && index < mpd_line) item.at(static_cast<std::size_t>(index)).listType = listType;
}

int MpdWid::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  drawRows();
  skia_add_box_c(header_box);
  skia_add_box_c(bottom_line);
  scrollTo(scroll_y);
  return 1;
}

void MpdWid::drawRows() {
  const int64_t top = int64_t{list_rect.y} - kDrawnAbove;
  const int64_t bottom = int64_t{list_rect.y} + list_rect.h;
  RowColumn column(scroll_y, kRowGap);
  visible_count = mpd_line;
  int hidden = 0;  // rows still to be passed over
  for (int i = 0; i < mpd_line; ++i) {
    Item& row = item.at(static_cast<std::size_t>(i));
    const int64_t y = column.nextTop();
    row.y = toPixels(y);
    if (hidden == 0) {
      hidden = hiddenFrom(i);
      visible_count -= hidden;
    }
    if (hidden > 0) {
      --hidden;
      continue;
    }
    if (isBetween(top, y, bottom)) drawRow(row);
    column.add(row.height);
  }
}

// How many rows from this one on are hidden by the one before. The last row never is.
int MpdWid::hiddenFrom(int first) const {
  const int last = mpd_line - 1;
  if (first == 0) return 0;
  const Item& parent = item.at(static_cast<std::size_t>(first) - 1);
  if (!isMarked(parent.marker, kCollapsed)) return 0;
  int end = first;
  while (end < last && item.at(static_cast<std::size_t>(end)).level > parent.level) ++end;
  return end - first;
}

void MpdWid::drawRow(const Item& row) {
  for (SKIA_Rect& each : cell) each = {each.x, row.y, each.w, row.height, row.color};
  for (const Marker& marker : {kCollapsed, kExpanded}) {
    if (isMarked(row.marker, marker)) cell[0].color = cell[1].color = marker.color;
  }
  skia_add_textbox_c(cell[0], row.marker);
  skia_add_textbox_c(cell[2], row.head);
  skia_add_textbox_c(cell[1], row.levelText);
  skia_add_textbox_c(cell[3], row.name);
  skia_add_staticbox_c(cell[4], row.value);
}

int MpdWid::hide() {
  setActive(0);
  return 1;
}

int MpdWid::Max_height() {
  const std::lock_guard guard(stateLock);
  return toPixels(countedColumn().height());
}

// The rows that the list's height counts.
RowColumn MpdWid::countedColumn() const {
  RowColumn column(list_rect.y, kRowGap);
  for (int i = 0; i < visible_count; ++i) {
    if (item.at(static_cast<std::size_t>(i)).listType != kHitEnd) column.add(kRowHeight);
  }
  return column;
}

void MpdWid::onHover_temp() {
  const std::lock_guard guard(stateLock);
  scrollTo(scroll_y);
}

void MpdWid::scrollTo(int64_t top) {
  const RowColumn column = countedColumn();
  const int64_t wanted = top - list_rect.y;
  // When all rows fit, a scroll above the list's top is left alone; any other becomes the top.
  if (column.height() < list_rect.h && wanted < 0) return;
  scroll_y = toPixels(list_rect.y + column.clampScroll(wanted, list_rect.h));
}

bool MpdWid::onRecvEvent(event_data* event, unsigned int) {
  if (event == nullptr) return false;
  switch (event->type) {
    case kEventKeyPress: onPressKey(event->key); return true;
    case kEventKeyRelease: onReleaseKey(event->key); return true;
    default: break;
  }
  if (!takesTouch(*event, list_rect, kEventLongPress)) return false;
  const LifeGuard self(this);
  switch (event->type) {
    case kEventMotion: onHover(event->mouse); return true;
    case kEventPress:
      onPress(event->mouse);
      if (self.isAlive()) onMpdPress(event);
      return true;
    case kEventRelease:
      onRelease(event->mouse);
      if (self.isAlive()) onMpdRelease(event);
      return true;
    default: return false;
  }
}

void MpdWid::onPressKey(kbd_event key) {
  logKeyPress(key);
  if (auto* const call = key_press_cb) call(&key, this);
}

void MpdWid::onReleaseKey(kbd_event key) {
  logKeyRelease(key);
  if (auto* const call = key_release_cb) call(&key, this);
}

void MpdWid::onPress(mouse_event mouse) {
  hold.press(mouse);
  pressRow(position2index(mouse));
  if (auto* const call = press_cb) call(&mouse, this);
}

void MpdWid::onMpdPress(event_data* event) {
  if (event == nullptr) return;
  kLog.print(LogLevel::Debug, "onMpdPress!!");
  {
    const std::lock_guard guard(stateLock);
    if (rect.color != kColorHighlight) normalColor = rect.color;
    rect.color = kColorHighlight;
  }
  hold.press(event->mouse);
  const unsigned int now = GetTicks();
  const bool isStale = taps.isStale(now);
  if (isStale) kLog.print(LogLevel::Debug, "nclick_start_ms < next_ms");
  if (isStale || !taps.isRunning()) kLog.print(LogLevel::Debug, "nclick_start_ms == 0");
  taps.press(now);
}

void MpdWid::onRelease(mouse_event mouse) {
  hold.letGo();
  const int row = position2index(mouse);
  const LifeGuard self(this);
  if (row == kEndRow && row == read(click).row()) {
    if (auto* const call = click_cb) call(&mouse, this);
  }
  if (!self.isAlive()) return;
  if (auto* const call = release_cb) call(&mouse, this);
}

void MpdWid::onMpdRelease(event_data* event) {
  kLog.print(LogLevel::Debug, "onMpdRelease!!");
  hold.letGo();
  {
    const std::lock_guard guard(stateLock);
    rect.color = normalColor;
  }
  if (taps.isRunning()) onTouchClickCount(event);
}

void MpdWid::onTouchClickCount(event_data* event) {
  kLog.print(LogLevel::Debug, "onTouchClickCount()");
  if (taps.tap(GetTicks()) != DoubleTap::kDouble) return;
  kLog.print(LogLevel::Debug, "touch_press_count == 2");
  depth_cal(event);
}

void MpdWid::depth_cal(event_data* event) {
  if (event == nullptr) return;
  const int y = event->mouse.y;
  const std::lock_guard guard(stateLock);
  for (int i = 0; i + 1 < mpd_line; ++i) {
    Item& row = item.at(static_cast<std::size_t>(i));
    if (!isBetween(row.y, y, item.at(static_cast<std::size_t>(i) + 1).y)) continue;
    if (isMarked(row.marker, kLeaf)) continue;
    row.marker = rowText((isMarked(row.marker, kCollapsed) ? kExpanded : kCollapsed).words);
  }
}

void MpdWid::onHover(mouse_event mouse) {
  inClick(mouse.xrel, mouse.yrel);
  {
    const std::lock_guard guard(stateLock);
    scrollTo(int64_t{scroll_y} + mouse.yrel);
  }
  if (auto* const call = hover_cb) call(&mouse, this);
}

void MpdWid::inClick(int dx, int dy) {
  const std::lock_guard guard(stateLock);
  click.move(dx, dy, touch_slop);
}

int MpdWid::position2index(mouse_event mouse) {
  const std::lock_guard guard(stateLock);
  RowColumn column(int64_t{list_rect.y} + scroll_y, kRowGap);  // the list's top counts twice
  for (int i = 0; i < mpd_line; ++i) {
    const Item& asked = item.at(static_cast<std::size_t>(i));
    if (asked.listType == kHitEnd) return kEndRow;
    const RowPlace row = column.add(asked.height);
    if (!row.isAt(mouse.y)) continue;
    logHit(row.top, mouse, row.bottom);
    return i;
  }
  return ClickSlop::kNone;
}

void MpdWid::control_context(int, SKIA_Rect*, char*) {}
void MpdWid::setText(int, const char*, unsigned int) {}
void MpdWid::setFontSize(int, int) {}
void MpdWid::setTextColor(int, int) {}

}  // namespace MW
