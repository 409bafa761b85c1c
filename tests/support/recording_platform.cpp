#include "support/recording_platform.h"

#include <android/log.h>
#include <brimol/display.h>
#include <brimol/properties.h>

#include <chrono>
#include <cstring>
#include <utility>

namespace brimol::test {

namespace {

constexpr std::chrono::microseconds kShortPause{20};

RecordingPlatform thePlatform;

template <std::size_t size>
void keep(std::array<char, size>& kept, const char* text) {
  kept.fill('\0');
  std::memcpy(kept.data(), text, strnlen(text, size - 1));
}

void receiveLog(const __android_logger_data* data, const char* message) {
  thePlatform.log(data->priority, data->tag, message);
}

DrawnText drawn(const SKIA_Text& text) {
  const auto length = static_cast<std::size_t>(text.string_len);
  // A length outside the record is kept as text that no expectation names.
  if (length >= SKIA_TEXT_BYTES) return {"length outside the record", 0, 0, text.string_len};
  return {std::string(text.text, length), text.color, text.align, text.size};
}

int draw(Call call, const SKIA_Rect& rect, const SKIA_Text& text) {
  return thePlatform.draw({.call = call, .rect = rect, .text = drawn(text)});
}

}  // namespace

RecordingPlatform& platform() { return thePlatform; }

void RecordingPlatform::reset() {
  __android_log_set_logger(receiveLog);
  __android_log_set_minimum_priority(ANDROID_LOG_VERBOSE);
  records = true;
  ticks = 0;
  live = 1;
  liveAsked = nextHandle = inits = quits = 0;
  xdpi = ydpi = 0;
  initFlags = 0;
  const std::lock_guard guard(lock);
  properties.clear();
  drawings.clear();
  lineCount = 0;
  delays.clear();
  fed.clear();
  cycle.clear();
  cycleNext = 0;
  cycleDue = 0;
  testThread = std::this_thread::get_id();
  pollingThread = {};
  pauses = Pauses::Short;
}

std::vector<Drawing> RecordingPlatform::takeDrawings() {
  const std::lock_guard guard(lock);
  return std::exchange(drawings, {});
}

std::vector<LogLine> RecordingPlatform::takeLog() {
  const std::lock_guard guard(lock);
  std::vector<LogLine> taken;
  for (std::size_t i = 0; i < lineCount; ++i) {
    taken.push_back({lines[i].priority, lines[i].tag.data(), lines[i].message.data()});
  }
  lineCount = 0;
  return taken;
}

std::vector<unsigned int> RecordingPlatform::takeDelays() {
  const std::lock_guard guard(lock);
  return std::exchange(delays, {});
}

void RecordingPlatform::feed(const Event& event) {
  const std::lock_guard guard(lock);
  fed.push_back(event);
}

void RecordingPlatform::feedOverAndOver(std::vector<Event> events) {
  const std::lock_guard guard(lock);
  cycle = std::move(events);
  cycleNext = 0;
}

void RecordingPlatform::setPauses(Pauses wanted) {
  const std::lock_guard guard(lock);
  pauses = wanted;
  changed.notify_all();
}

void RecordingPlatform::awaitParked(int threads) {
  std::unique_lock guard(lock);
  changed.wait(guard, [&] { return parked == threads; });
}

int RecordingPlatform::draw(const Drawing& drawing) {
  if (records) {
    const std::lock_guard guard(lock);
    drawings.push_back(drawing);
  }
  return nextHandle;
}

void RecordingPlatform::log(int priority, const char* tag, const char* message) {
  if (!records) return;
  const std::lock_guard guard(lock);
  if (lineCount == lines.size()) return;
  KeptLine& line = lines[lineCount++];
  line.priority = priority;
  keep(line.tag, tag);
  keep(line.message, message);
}

int RecordingPlatform::poll(Event& event) {
  const std::lock_guard guard(lock);
  pollingThread = std::this_thread::get_id();
  if (!fed.empty()) {
    event = fed.front();
    fed.pop_front();
    return 1;
  }
  if (cycle.empty() || cycleDue == 0) return 0;
  --cycleDue;
  event = cycle[cycleNext];
  cycleNext = (cycleNext + 1) % cycle.size();
  return 1;
}

void RecordingPlatform::delay(unsigned int ms) {
  std::unique_lock guard(lock);
  if (std::this_thread::get_id() == testThread) {
    delays.push_back(ms);
    return;
  }
  if (std::this_thread::get_id() != pollingThread) cycleDue = 1;
  if (pauses == Pauses::Parked) park(guard);
  guard.unlock();
  std::this_thread::sleep_for(kShortPause);
}

void RecordingPlatform::park(std::unique_lock<std::mutex>& guard) {
  ++parked;
  changed.notify_all();
  changed.wait(guard, [&] { return pauses == Pauses::Short; });
  --parked;
}

}  // namespace brimol::test

using brimol::test::Call;
using brimol::test::draw;
using brimol::test::platform;

int skia_add_box_c(SKIA_Rect rect) { return platform().draw({.call = Call::Box, .rect = rect}); }
int skia_add_roundbox_c(SKIA_Rect rect) {
  return platform().draw({.call = Call::RoundBox, .rect = rect});
}
int skia_add_line_c(SKIA_Point line) { return platform().draw({.call = Call::Line, .line = line}); }
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
  return platform().draw({.call = Call::Arrow, .rect = rect, .line = direction});
}

int skia_add_widget_c(const SKIA_Item* item) {
  if (item == nullptr) return -1;
  return platform().draw({.call = Call::Item,
                          .rect = item->rect,
                          .line = item->point,
                          .text = brimol::test::drawn(item->text),
                          .kind = item->kind});
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
int PollEvent(Event* event) { return platform().poll(*event); }
unsigned int GetTicks() { return platform().ticks; }
void Delay(unsigned int ms) { platform().delay(ms); }

void getDpi(float* xdpi, float* ydpi) {
  *xdpi = platform().xdpi;
  *ydpi = platform().ydpi;
}

// NOLINTNEXTLINE(readability-identifier-naming): the contract's name
int property_get(const char* key, char* value, const char* default_value) {
  const auto found = platform().properties.find(key);
  const std::string text = found != platform().properties.end() ? found->second
                           : default_value != nullptr           ? default_value
                                                                : "";
  const std::size_t length = text.copy(value, BRIMOL_PROPERTY_BYTES - 1);
  value[length] = '\0';
  return static_cast<int>(length);
}

int property_set(const char* key, const char* value) {
  platform().properties[key] = value;
  return 0;
}
