#include <MW/static_text.h>
#include <MW/window.h>
#include <brimol/input.h>
#include <brimol/properties.h>

#include <algorithm>
#include <exception>
#include <utility>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/geometry.h"
#include "core/life_guard.h"
#include "text/text_parts.h"

namespace MW {

namespace {

constexpr const char* kInfoProperty = "brimol.info.type";
constexpr std::string_view kCpu = "cpu";
constexpr int kCpuBytes = 80;        // in a row
constexpr int kBytesForNumbers = 8;  // more where no numbers stand before the rows
constexpr int kRowsLeftFree = 2;
constexpr int kMotionsPassedOver = 3;  // between two that scroll

// A character is 63 hundredths of the font size wide. An even number.
constexpr int bytesAcross(int width, int size) {
  constexpr int64_t kWidthPercent = 63;
  constexpr int64_t kWhole = 100;
  if (size < 1) return 0;
  return toPixels(width / size * kWhole / kWidthPercent / 2 * 2);
}
static_assert(bytesAcross(1440, 40) == 56 && bytesAcross(-1440, 40) == -56);
static_assert(bytesAcross(1440, 0) == 0 && bytesAcross(1440, -1) == 0);

constexpr int rowsDown(int height, int size) {
  if (size < 1) return 0;
  return toPixels(int64_t{height / size} - kRowsLeftFree);
}
static_assert(rowsDown(2560, 40) == 62 && rowsDown(79, 40) == -1 && rowsDown(2560, 0) == 0);

// Texts that are set again and again and keep their place.
bool isRefreshed(std::string_view info) { return info == kCpu || info == "gpu" || info == "ddr"; }

}  // namespace

StaticText::StaticText(const SKIA_Rect* area, const SKIA_Text* looks, bool numbers, bool scroll,
                       bool mark)
    : TextPanel("STATICTEXT") {
  init(area, looks);
  is_line_num = numbers;
  is_scroll = scroll;
  is_search_mark = mark;
  StaticText::setText(text.text);
}

StaticText::StaticText(const SKIA_Rect* area, const SKIA_Text* looks)
    : StaticText(area, looks, false, true, false) {}

StaticText::~StaticText() { leaveWindow(); }

void StaticText::init(const SKIA_Rect* area, const SKIA_Text* looks) {
  setActive(0);
  setType(kBaseLayer);
  takeLooks(area, looks);
  press_cb = release_cb = long_press_cb = double_tap_cb = nullptr;
  gesture.reset();
  Window::registerWidget(this);
  info_type.fill('\0');
  property_get(kInfoProperty, info_type.data(), "");
  const bool isCpu = info_type.data() == kCpu;
  if (isCpu) kViewerLog.print(LogLevel::Debug, "w_count = 80 (only cpu clock)");
  hover_count = 0;
  const std::lock_guard guard(stateLock);
  showTimer = {};
  num_text = text;
  num_text.color = kColorBlue;
  // The constructor has not stored its flags yet: rows are as long as without numbers.
  measure();
  if (isCpu) w_count = kCpuBytes + (is_line_num ? 0 : kBytesForNumbers);
  is_setting = highlight = top_index = line_count = last_index = 0;
  lines = {};
  found_lines = {};
  found_index = {};
}

void StaticText::setRect(int, const SKIA_Rect* newRect) {
  if (newRect == nullptr) return;
  const std::lock_guard guard(stateLock);
  rect = {newRect->x, newRect->y, newRect->w, newRect->h, rect.color};
  measure();
}

void StaticText::measure() {
  h_count = rowsDown(rect.h, text.size);
  w_count =
      toPixels(int64_t{bytesAcross(rect.w, text.size)} + (is_line_num ? 0 : kBytesForNumbers));
}

void StaticText::setText(const char* newText) {
  const std::string_view given = wholeText(newText);
  std::size_t rowBytes = 0;
  {
    TextLines old;  // freed when the lock is free
    const std::lock_guard guard(stateLock);
    is_setting = 1;
    std::swap(old, lines);
    rowBytes = static_cast<std::size_t>(std::clamp(w_count, 1, kTextMax));
  }
  if (given.empty()) return;
  const auto lineEnds = static_cast<std::size_t>(std::ranges::count(given, '\n'));
  const std::size_t needed = lineEnds + given.size() / rowBytes + 1;
  logRows(needed);
  try {
    TextLines cut(given, rowBytes, needed);
    const std::lock_guard guard(stateLock);
    std::swap(lines, cut);
    line_count = lines.count();
    last_index = line_count == 1 ? 0 : line_count;
    is_setting = 0;
  } catch (const std::exception&) {
    return;  // "no log" stays
  }
}

void StaticText::logRows(std::size_t needed) const {
  auto rows = static_cast<int64_t>(needed);
  int fitting = 0;
  {
    const std::lock_guard guard(stateLock);
    fitting = h_count;
    if (isRefreshed(info_type.data())) rows = std::max(rows, int64_t{top_index} + h_count);
  }
  kViewerLog.print(LogLevel::Debug, "max_num_of_lines : %d", toPixels(rows));
  kViewerLog.print(LogLevel::Debug, "h_count: %d", fitting);
}

bool StaticText::onRecvEvent(event_data* event, unsigned int) {
  if (!is_scroll) return true;
  if (!follows(event)) return false;
  switch (event->type) {
    case kEventMotion:
      if (!hold.isHeld()) return false;
      onHover(event->mouse);
      return true;
    case kEventPress: onPress(event); return true;
    case kEventRelease: onRelease(event); return true;
    case kEventLongPress: onPressLong(event); return true;
    default: return false;
  }
}

void StaticText::tell(TextTouch what) const {
  void (*called)(int) = nullptr;
  switch (what) {
    case TextTouch::None: return;
    case TextTouch::Press: called = press_cb; break;
    case TextTouch::Release: called = release_cb; break;
    case TextTouch::LongPress: called = long_press_cb; break;
    case TextTouch::DoubleTap: called = double_tap_cb; break;
  }
  if (called != nullptr) called(0);
}

void StaticText::onPress(event_data* event) {
  if (event == nullptr) return;
  const LifeGuard self(this);
  tell(takePress(*event));
  if (self.isAlive() && double_tap_cb != nullptr) gesture.awaitTap(GetTicks());
}

void StaticText::onRelease(event_data* event) {
  const LifeGuard self(this);
  const TextTouch what = takeRelease(event);
  tell(what);
  if (self.isAlive() && double_tap_cb != nullptr && gesture.isTapDue(what)) onTouchClickCount();
  kViewerLog.print(LogLevel::Debug, "released!!");
}

void StaticText::onTouchClickCount() { tell(takeTap()); }

void StaticText::onHover(mouse_event mouse) {
  kViewerLog.print(LogLevel::Debug, "onHover!!");
  if (hover_count++ < kMotionsPassedOver) return;
  hover_count = 0;
  const std::lock_guard guard(stateLock);
  if (mouse.yrel < 0 && top_index < rowsBeyondView()) {
    ++top_index;
  } else if (mouse.yrel > 0 && top_index > 0) {
    --top_index;
  }
}

void StaticText::onPressLong(event_data* event) {
  const LifeGuard self(this);
  tell(takeLongPress());
  if (!self.isAlive() || event == nullptr || jumpTo(event->mouse)) return;
  kViewerLog.print(LogLevel::Debug, "onPressLong is not correct!!");
}

// False where the area is too low for the bar that was drawn last.
bool StaticText::jumpTo(const mouse_event& mouse) {
  const std::lock_guard guard(stateLock);
  const int64_t right = int64_t{rect.x} + rect.w;
  if (mouse.x < right - int64_t{2} * scroll_bar.w || mouse.x > right) return true;
  const int half = scroll_bar.h / 2;
  const int64_t span = int64_t{rect.h} - half;
  if (span <= 0) return false;
  const int64_t y = int64_t{mouse.y} - rect.y;
  const int64_t wanted = y < half ? 0 : rowsBeyondView() * std::min(y, span) / span;
  top_index = toPixels(std::max<int64_t>(wanted, 0));
  return true;
}

}  // namespace MW
