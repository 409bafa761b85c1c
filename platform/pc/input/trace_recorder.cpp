#include "input/trace_recorder.h"

#include <array>
#include <charconv>
#include <utility>

#include "input/trace_steps.h"
#include "scene/item_text.h"
#include "scene/quoted_text.h"

namespace brimol::pc {

namespace {

struct RecordName {
  int type;
  const char* word;
};
constexpr auto kRecordNames = std::to_array<RecordName>({{BRIMOL_POINTER_DOWN, "down"},
                                                         {BRIMOL_POINTER_UP, "up"},
                                                         {BRIMOL_POINTER_MOTION, "motion"},
                                                         {BRIMOL_LONG_PRESS, "long"},
                                                         {BRIMOL_KEY_DOWN, "keydown"},
                                                         {BRIMOL_KEY_UP, "keyup"}});

std::string pointerWords(const BrimolPointerEvent& pointer) {
  std::string words = ' ' + std::to_string(pointer.finger) + ' ' + std::to_string(pointer.x) + ' ' +
                      std::to_string(pointer.y);
  if (pointer.type == BRIMOL_POINTER_MOTION) {
    words += ' ' + std::to_string(pointer.xrel) + ' ' + std::to_string(pointer.yrel);
  }
  return words;
}

}  // namespace

std::string textOfRecord(const Event& record) {
  if (record.type == BRIMOL_USER_EVENT) {
    return "user " + std::to_string(record.user.word1) + ' ' + std::to_string(record.user.word2);
  }
  for (const auto& [type, word] : kRecordNames) {
    if (type != record.type) continue;
    const bool isKey = type == BRIMOL_KEY_DOWN || type == BRIMOL_KEY_UP;
    return word + (isKey ? ' ' + std::to_string(record.key.code) : pointerWords(record.pointer));
  }
  return {};
}

std::string TraceRecorder::open() {
  std::string error;
  if (!out) out.emplace(path, error);
  if (!error.empty()) out.reset();
  return error;
}

void TraceRecorder::begin() {
  hasBegun = true;
  for (const std::string& lines : std::exchange(early, {})) out->write(lines);
}

void TraceRecorder::write(const std::string& lines) {
  if (hasBegun) {
    out->write(lines);
  } else {
    early.push_back(lines);
  }
}

void TraceRecorder::startScript(uint32_t clockStart) {
  write("brimol-trace 1");
  write("clock start " + std::to_string(clockStart));
  write("linger 5000");  // a crash comes after the last line
}

void TraceRecorder::start(uint32_t clockStart, uint64_t utcMs, uint64_t seed) {
  write("brimol-trace 1 recording");
  write("clock start " + std::to_string(clockStart));
  write("world time " + utcText(utcMs));
  write("world random " + std::to_string(seed));
}

void TraceRecorder::clockStep(uint32_t ms) { write("clock step " + std::to_string(ms)); }

void TraceRecorder::screen(Size size) {
  write("screen " + std::to_string(size.w) + 'x' + std::to_string(size.h));
}

void TraceRecorder::density(float dotsPerInch) {
  std::array<char, 32> digits = {};
  const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), dotsPerInch).ptr;
  write("density " + std::string(digits.data(), end));
}

void TraceRecorder::input(uint64_t time, const Event& record) {
  const std::string words = textOfRecord(record);
  if (!words.empty()) write(std::to_string(time) + ' ' + words);
}

void TraceRecorder::userCloses(uint64_t time) { write(std::to_string(time) + " close"); }

void TraceRecorder::figure(uint64_t time, const std::string& name, const std::string& value) {
  write(std::to_string(time) + " world figure " + inQuotes(name) + ' ' + inQuotes(value));
}

void TraceRecorder::frame(uint64_t time, const std::vector<std::string>& items) {
  std::string lines = std::to_string(time) + " frame " + hashText(hashOf(items)) + ' ' +
                      std::to_string(items.size());
  for (std::size_t i = 0; i < items.size(); ++i) {
    if (i < lastItems.size() && lastItems[i] == items[i]) continue;
    lines += "\n| " + std::to_string(i) + ' ' + items[i];
  }
  lastItems = items;
  write(lines);
}

void TraceRecorder::end(uint64_t time) { write(std::to_string(time) + " end"); }

}  // namespace brimol::pc
