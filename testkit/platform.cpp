#include <brimol3_widget_test/platform.h>

#include <android/log.h>
#include <brimol/display.h>
#include <brimol/frame.h>
#include <brimol/properties.h>
#include <brimol3_widget_test/failure.h>

#include <algorithm>
#include <charconv>
#include <chrono>
#include <cstdlib>
#include <cstring>
#include <new>
#include <string_view>

namespace brimol::test {

namespace {

constexpr std::chrono::microseconds kShortPause{20};

// Never deleted: threads still log while the program ends.
RecordingPlatform& thePlatform = *new RecordingPlatform;

// A line that finds no memory is lost: tests let allocations fail.
void receiveLog(const __android_logger_data* data, const char* message) {
  const std::lock_guard guard(thePlatform.lock);
  if (!thePlatform.records) return;
  try {
    thePlatform.lines.push_back({data->priority, data->tag, message});
  } catch (const std::bad_alloc&) {
    return;
  }
}

// Counts down to the call that fails. The platform's lock is held.
bool failsNow() { return thePlatform.failingCall > 0 && --thePlatform.failingCall == 0; }

DrawnText drawn(const SKIA_Text& text) {
  const auto length = static_cast<std::size_t>(text.string_len);
  // A length outside the record is kept as a text that fits into none.
  if (length >= SKIA_TEXT_BYTES) return {std::string(SKIA_TEXT_BYTES, '?'), 0, 0, text.string_len};
  return {std::string(text.text, length), text.color, text.align, text.size};
}

int draw(Call call, const SKIA_Rect& rect, const SKIA_Text& text = {}, const SKIA_Point& line = {},
         int kind = 0) {
  const std::lock_guard guard(thePlatform.lock);
  if (thePlatform.records) thePlatform.drawings.push_back({call, rect, line, drawn(text), kind});
  return failsNow() ? -1 : thePlatform.nextHandle;
}

}  // namespace

RecordingPlatform& platform() { return thePlatform; }

unsigned int clockBase() {
  const char* const wanted = std::getenv("BRIMOL_TEST_CLOCK");
  if (wanted == nullptr) return 0;
  unsigned int base = 0;
  const char* const end = wanted + std::strlen(wanted);
  const auto [stop, problem] = std::from_chars(wanted, end, base);
  if (problem == std::errc() && stop == end) return base;
  throw Failure(Here::now(),
                std::string("BRIMOL_TEST_CLOCK: no number of milliseconds: ") + wanted);
}

void RecordingPlatform::reset() {
  __android_log_set_logger(receiveLog);
  __android_log_set_minimum_priority(ANDROID_LOG_VERBOSE);
  const std::lock_guard guard(lock);
  static_cast<PlatformState&>(*this) = {};
  ticks = clockBase();
  testThread = std::this_thread::get_id();
}

}  // namespace brimol::test

using brimol::test::Call;
using brimol::test::draw;
using brimol::test::failsNow;
using brimol::test::platform;

// What was drawn before goes into no frame.
void skia_begin_frame_c() { platform().takeDrawings(); }
void skia_end_frame_c() {}

int skia_add_box_c(SKIA_Rect rect) { return draw(Call::Box, rect); }
int skia_add_roundbox_c(SKIA_Rect rect) { return draw(Call::RoundBox, rect); }
int skia_add_line_c(SKIA_Point line) { return draw(Call::Line, {}, {}, line); }
int skia_add_label_c(SKIA_Rect rect, SKIA_Text text) { return draw(Call::Label, rect, text); }
int skia_add_textbox_c(SKIA_Rect rect, SKIA_Text text) { return draw(Call::Textbox, rect, text); }
int skia_add_roundtextbox_c(SKIA_Rect rect, SKIA_Text text) {
  return draw(Call::RoundTextbox, rect, text);
}
int skia_add_buttonbox_c(SKIA_Rect rect, SKIA_Text text) {
  return draw(Call::ButtonBox, rect, text);
}
int skia_add_roundbuttonbox_c(SKIA_Rect rect, SKIA_Text text) {
  return draw(Call::RoundButtonBox, rect, text);
}
int skia_add_staticbox_c(SKIA_Rect rect, SKIA_Text text) {
  return draw(Call::StaticBox, rect, text);
}
int skia_add_arrow_c(SKIA_Rect rect, SKIA_Point direction) {
  return draw(Call::Arrow, rect, {}, direction);
}
int skia_add_widget_c(const SKIA_Item* item) {
  if (item == nullptr) return -1;
  return draw(Call::Item, item->rect, item->text, item->point, item->kind);
}

int skia_live_widget_c() {
  ++platform().liveAsked;
  return platform().live;
}

int EventInit(unsigned int flags) {
  ++platform().inits;
  platform().initFlags = flags;
  return 1;
}

void EventQuit() { ++platform().quits; }

int PollEvent(Event* event) {
  const std::lock_guard guard(platform().lock);
  if (platform().fed.empty()) return 0;
  *event = platform().fed.front();
  platform().fed.pop_front();
  return 1;
}

unsigned int GetTicks() { return platform().ticks; }

void Delay(unsigned int ms) {
  if (std::this_thread::get_id() == platform().testThread) {
    platform().paused += ms;
    return;
  }
  if (!platform().turns.pause(platform().ticks, ms)) {
    std::this_thread::sleep_for(brimol::test::kShortPause);
  }
}

void getDpi(float* xdpi, float* ydpi) {
  if (xdpi != nullptr) *xdpi = platform().xdpi;
  if (ydpi != nullptr) *ydpi = platform().ydpi;
}

// NOLINTNEXTLINE(readability-identifier-naming): the parameters are named as in the contract
int property_get(const char* key, char* value, const char* default_value) {
  const std::lock_guard guard(platform().lock);
  if (!platform().hasProperties || failsNow()) return -1;
  // Without memory: tests let allocations fail.
  const auto& all = platform().properties;
  const auto found = std::ranges::find(
      all, std::string_view(key), [](const auto& each) { return std::string_view(each.first); });
  const std::string_view text =
      found != all.end() ? std::string_view(found->second) : default_value;
  const std::size_t length = text.copy(value, BRIMOL_PROPERTY_BYTES - 1);
  value[length] = '\0';
  return static_cast<int>(length);
}

int property_set(const char* key, const char* value) {
  const std::lock_guard guard(platform().lock);
  if (!platform().hasProperties || failsNow()) return -1;
  platform().properties.insert_or_assign(key, value);
  return 0;
}
