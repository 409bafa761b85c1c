#include <MW/ime.h>
#include <MW/window.h>
#include <brimol/input.h>
#include <brimol/properties.h>

#include <algorithm>
#include <cstring>

#include "core/bounded_text.h"
#include "core/class_log.h"
#include "core/hit_test.h"
#include "core/life_guard.h"
#include "text/ime_keys.h"
#include "text/text_parts.h"

namespace MW {

namespace {

constexpr ClassLog kLog("IME");
constexpr std::size_t kBar = 0;
constexpr std::size_t kFoldKey = 39;
constexpr std::size_t kNoKey = kImeKeys.size();
constexpr std::size_t kMostTyped = 15;  // bytes
constexpr const char* kFoldProperty = "brimol.info_1.ime_flag";
static_assert(kImeKeys[kFoldKey].role == KeyRole::Fold);

struct Layout {
  const char* handler;  // its name in the log
  std::size_t labels;   // those that are typed
  Ime::KeyType next;    // where shift leads
};

// By Ime::KeyType.
constexpr auto kLayouts = std::to_array<Layout>({
    {"onPressKey_small", 0, Ime::kCapitals},
    {"onPressKey_big", 1, Ime::kSpecial},
    {"onPressKey_special", 2, Ime::kSmall},
    {"onPressKey_only_num", 0, Ime::kOnlyDigits},
});

const Layout& layoutOf(int type) { return kLayouts.at(static_cast<std::size_t>(type)); }

// A digit or letter types its label, the blank a blank, any other key nothing.
std::string_view typedBy(const ImeKey& key, int layout) {
  if (key.role == KeyRole::Space) return " ";
  if (key.role != KeyRole::Digit && key.role != KeyRole::Letter) return "";
  return key.labels.at(layoutOf(layout).labels);
}

}  // namespace

Ime::Ime(const SKIA_Rect* area, const SKIA_Text* looks) : TextPanel("IME") {
  takeLooks(area, looks);
  layOutKeys();
  std::ranges::fill(text.text, '\0');  // of the text, the length alone is kept
  Window::registerWidget(this);
}

Ime::~Ime() { leaveWindow(); }

void Ime::layOutKeys() {
  for (std::size_t key = 0; key < kImeKeys.size(); ++key) {
    rectOf(key) = keyRect(kImeKeys.at(key), rect);
    key_text.at(key) =
        makeText(kImeKeys.at(key).labels.front(), text.color, SKIA_ALIGN_CENTRE, text.size);
  }
}

SKIA_Rect& Ime::rectOf(std::size_t key) {
  if (key == kFoldKey) return fold_rect;
  return key_rect.at(key < kFoldKey ? key : key - 1);
}

int Ime::show(unsigned int) {
  const std::lock_guard guard(stateLock);
  skia_add_box_c(rect);
  for (std::size_t key = 0; key < kImeKeys.size(); ++key) {
    skia_add_buttonbox_c(rectOf(key), key_text.at(key));
  }
  return 1;
}

void Ime::setRect(int, const SKIA_Rect* newRect) {
  if (newRect == nullptr) return;
  const std::lock_guard guard(stateLock);
  rect = {newRect->x, newRect->y, newRect->w, newRect->h, rect.color};
}

char* Ime::getResultString() { return result_string.data(); }
void Ime::setResultString(const char* result) { write(result_string, shortText(result)); }

void Ime::typing_reset() {
  const std::lock_guard guard(stateLock);
  temp_searched.fill('\0');
  result_string.fill('\0');
  std::ranges::fill(key_text.at(kBar).text, '\0');
}

void Ime::presskey_set(unsigned int type) {
  if (type < kLayouts.size()) write(key_type, static_cast<int>(type));
}

void Ime::keyboard_change(unsigned int type) {
  const std::lock_guard guard(stateLock);
  for (std::size_t key = 0; key < kImeKeys.size(); ++key) {
    const ImeKey& row = kImeKeys.at(key);
    if (!isGreyed(row.role)) continue;
    if (type < row.labels.size()) putText(key_text.at(key), row.labels.at(type));
    if (type == kSmall) rectOf(key).color = kColorWhite;
    if (type == kOnlyDigits) rectOf(key).color = kPanelGrey;
  }
}

bool Ime::get_fold_status() { return read(fold_status); }
void Ime::set_fold_status(bool folded) { write(fold_status, folded); }

bool Ime::onRecvEvent(event_data* event, unsigned int) {
  if (!follows(event)) return false;
  switch (event->type) {
    case kEventMotion:
      if (!hold.isHeld()) return false;
      onHover(event->mouse);
      return true;
    case kEventPress: pressKey(read(key_type), event); return true;
    case kEventRelease: onRelease(event); return true;
    case kEventLongPress: onPressLong(event); return true;
    default: return false;
  }
}

void Ime::tell(TextTouch what) {
  void (*called)(int, Ime*) = nullptr;
  switch (what) {
    case TextTouch::None: return;
    case TextTouch::Press: called = press_cb; break;
    case TextTouch::Release: called = release_cb; break;
    case TextTouch::LongPress: called = long_press_cb; break;
    case TextTouch::DoubleTap: called = double_tap_cb; break;
  }
  if (called != nullptr) called(0, this);
}

void Ime::onPress(event_data* event) {
  if (event == nullptr) return;
  const LifeGuard self(this);
  tell(takePress(*event));
  if (self.isAlive() && double_tap_cb != nullptr) gesture.awaitTap(GetTicks());
}

void Ime::onRelease(event_data* event) {
  const LifeGuard self(this);
  const TextTouch what = takeRelease(event);
  tell(what);
  if (self.isAlive() && double_tap_cb != nullptr && gesture.isTapDue(what)) onTouchClickCount();
  kLog.print(LogLevel::Debug, "released!!");
}

void Ime::onPressLong(event_data*) { tell(takeLongPress()); }
void Ime::onTouchClickCount() { tell(takeTap()); }

// NOLINTNEXTLINE(readability-convert-member-functions-to-static): an operation of the keyboard
void Ime::onHover(mouse_event) { kLog.print(LogLevel::Debug, "onHover!!"); }

void Ime::onPressKey_small(event_data* event) { pressKey(kSmall, event); }
void Ime::onPressKey_big(event_data* event) { pressKey(kCapitals, event); }
void Ime::onPressKey_special(event_data* event) { pressKey(kSpecial, event); }
void Ime::onPressKey_only_num(event_data* event) { pressKey(kOnlyDigits, event); }

void Ime::pressKey(int layout, const event_data* event) {
  if (event == nullptr) return;
  kLog.print(LogLevel::Debug, "%s pressed!!", layoutOf(layout).handler);
  const int length = measureTyped();
  kLog.print(LogLevel::Debug, "t_search_bar.string_len0 : %d", length);
  const std::size_t key = keyAt(event->mouse);
  if (key != kNoKey) act(kImeKeys.at(key), layout);
  kLog.print(LogLevel::Debug, "t_search_bar.string_len1 : %d", length);
  kLog.print(LogLevel::Debug, "t_search_bar.string_len2 : %d", showTyped());
}

int Ime::measureTyped() {
  const std::lock_guard guard(stateLock);
  int32_t& length = key_text.at(kBar).string_len;
  length = static_cast<int32_t>(typedLength());
  return length;
}

std::size_t Ime::typedLength() const {
  return strnlen(temp_searched.data(), temp_searched.size() - 1);
}

int Ime::showTyped() {
  const std::lock_guard guard(stateLock);
  // What was taken back stays behind the new end: the length alone says where that is.
  putTextOpen(key_text.at(kBar), boundedText(temp_searched.data()));
  return key_text.at(kBar).string_len;
}

std::size_t Ime::keyAt(const mouse_event& mouse) {
  const std::lock_guard guard(stateLock);
  std::size_t key = 0;
  while (key < kNoKey && !containsInside(rectOf(key), positionOf(mouse))) ++key;
  return key;
}

void Ime::act(const ImeKey& key, int layout) {
  if (layout == kOnlyDigits && isGreyed(key.role)) return;
  switch (key.role) {
    case KeyRole::Back: return eraseLast();
    case KeyRole::Fold: return fold(layout);
    case KeyRole::Enter: return enter();
    case KeyRole::Shift: return shift(layout);
    default: return append(typedBy(key, layout));
  }
}

void Ime::append(std::string_view typed) {
  const std::lock_guard guard(stateLock);
  const std::size_t length = typedLength();
  if (length < kMostTyped) std::ranges::copy(typed, &temp_searched.at(length));
}

void Ime::eraseLast() {
  const std::lock_guard guard(stateLock);
  const std::size_t length = typedLength();
  if (length > 0) temp_searched.at(length - 1) = '\0';
}

void Ime::fold(int layout) {
  if (layout == kOnlyDigits) property_set(kFoldProperty, "true");
  const std::lock_guard guard(stateLock);
  fold_status = true;
  temp_searched.fill('\0');
}

// The typed text stays, and so does the tail of a longer result.
void Ime::enter() {
  const auto typed = read(temp_searched);
  {
    const std::lock_guard guard(stateLock);
    std::ranges::copy(boundedText(typed.data()), result_string.begin());
    std::ranges::fill(key_text.at(kBar).text, '\0');
  }
  kLog.print(LogLevel::Debug, "enter -> search start temp_searched : %s", typed.data());
}

void Ime::shift(int layout) {
  kLog.print(LogLevel::Debug, "shift : %s", read(temp_searched).data());
  const KeyType next = layoutOf(layout).next;
  keyboard_change(next);
  write(key_type, next);
}

}  // namespace MW
