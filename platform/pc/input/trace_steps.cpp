#include "input/trace_steps.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <ctime>
#include <filesystem>
#include <limits>
#include <string_view>
#include <utility>

#include "input/event_records.h"
#include "input/keymap.h"
#include "input/pointers.h"

namespace brimol::pc {

namespace {

constexpr uint32_t kStrokeMs = 50;
constexpr uint32_t kDragMs = 200;
constexpr uint32_t kExpectMs = 1000;
constexpr uint32_t kWaitUntilMs = 10'000;
constexpr uint64_t kMostPixels = 65535;
constexpr uint64_t kMostWord = std::numeric_limits<uint32_t>::max();
constexpr int kMostMotion = std::numeric_limits<int16_t>::max();
constexpr std::size_t kColourDigits = 6;

int readFinger(TraceWords& words) {
  if (!words.takes("finger")) return 0;
  return static_cast<int>(words.number("a finger", Pointers::kFingers - 1));
}

TraceStep::Action readTap(TraceWords& words) {
  Touch touch = {.kind = Touch::Kind::Tap, .place = words.place(), .to = {}};
  touch.duration = words.milliseconds("for", kStrokeMs);
  touch.finger = readFinger(words);
  return touch;
}

TraceStep::Action readPress(TraceWords& words) {
  Touch touch = {.kind = Touch::Kind::Press, .place = words.place(), .to = {}};
  touch.finger = readFinger(words);
  return touch;
}

TraceStep::Action readMove(TraceWords& words) {
  Touch touch = {.kind = Touch::Kind::Move, .place = {}, .to = {}};
  if (words.takes("by")) {
    touch.kind = Touch::Kind::MoveBy;
    touch.place.x = words.distance();
    touch.place.y = words.distance();
  } else {
    touch.place = words.place();
  }
  touch.duration = words.milliseconds("over", 0);
  touch.finger = readFinger(words);
  return touch;
}

TraceStep::Action readRelease(TraceWords& words) {
  Touch touch = {.kind = Touch::Kind::Release, .place = {}, .to = {}};
  touch.finger = readFinger(words);
  return touch;
}

TraceStep::Action readDrag(TraceWords& words) {
  Touch touch = {.kind = Touch::Kind::Drag, .place = words.place(), .to = {}};
  words.expect("to");
  touch.to = words.place();
  touch.duration = words.milliseconds("over", kDragMs);
  touch.finger = readFinger(words);
  return touch;
}

uint32_t readKeyCode(TraceWords& words) {
  if (const auto code = phoneKeyNamed(words.peek())) {
    (void)words.word("a key");
    return *code;
  }
  return static_cast<uint32_t>(words.number("the name of a key, or a number", kMostWord));
}

TraceStep::Action readKey(TraceWords& words) {
  KeyStroke stroke;
  // "up" and "down" are keys, too, unless a key follows.
  TraceWords ahead = words;
  const std::string first = ahead.word("a key");
  const bool isHalf =
      (first == "down" || first == "up") && !ahead.isAtEnd() && ahead.peek() != "for";
  if (isHalf) {
    stroke.kind = first == "down" ? KeyStroke::Kind::Down : KeyStroke::Kind::Up;
    (void)words.word("a key");
  }
  stroke.code = readKeyCode(words);
  if (!isHalf) stroke.duration = words.milliseconds("for", kStrokeMs);
  return stroke;
}

TraceStep::Action readType(TraceWords& words) { return Typing{words.text("what is typed")}; }

uint32_t readColour(TraceWords& words) {
  const std::string shown = words.word("a colour as #RRGGBB");
  if (!shown.starts_with('#')) throw BadLine{"'" + shown + "' is not a colour as #RRGGBB"};
  TraceWords digits(shown.substr(1));
  return static_cast<uint32_t>(digits.hexadecimal("a colour as #RRGGBB", kColourDigits));
}

Look readSubject(TraceWords& words) {
  using Subject = Look::Subject;
  Look look;
  if (words.takes("pixel")) {
    look.subject = Subject::Pixel;
    look.x = words.coordinate();
    look.y = words.coordinate();
    look.colour = readColour(words);
    return look;
  }
  const bool isNo = words.takes("no");
  if (words.takes("log")) {
    look.subject = isNo ? Subject::NoLog : Subject::Log;
    look.pattern = words.pattern();
    return look;
  }
  words.expect("text");
  look.subject = isNo ? Subject::NoText : Subject::Text;
  look.pattern = words.pattern();
  if (words.takes("in")) {
    SearchArea area;
    for (Coordinate* each : {&area.x, &area.y, &area.w, &area.h}) *each = words.coordinate();
    look.area = area;
  }
  return look;
}

Look readLook(TraceWords& words, uint32_t unsaid) {
  Look look = readSubject(words);
  look.within = look.subject == Look::Subject::NoLog ? 0 : words.milliseconds("within", unsaid);
  return look;
}

TraceStep::Action readExpect(TraceWords& words) { return readLook(words, kExpectMs); }

TraceStep::Action readWait(TraceWords& words) {
  if (words.takes("until")) return readLook(words, kWaitUntilMs);
  constexpr uint64_t kMostMs = 86'400'000;  // a day
  return Pause{
      static_cast<uint32_t>(words.number("'until', or a number of milliseconds", kMostMs))};
}

// A trace writes pictures below the session's folder, and nothing else.
TraceStep::Action readShot(TraceWords& words) {
  Shot shot{words.isTextNext() ? words.text("a file") : words.word("a file")};
  const std::filesystem::path path(shot.file);
  if (path.extension() != ".png" || shot.file.find('\0') != std::string::npos) {
    throw BadLine{"a picture needs a file name that ends in .png"};
  }
  if (path.is_absolute() || std::ranges::count(path, "..") != 0) {
    throw BadLine{"'" + shot.file + "' does not lie below the session's folder"};
  }
  return shot;
}

TraceStep::Action readWorld(TraceWords& words) {
  WorldChange change;
  if (words.takes("time")) {
    change.number = readUtc(words.word("a time"));
  } else if (words.takes("random")) {
    change.kind = WorldChange::Kind::Random;
    change.number = words.number("a seed", std::numeric_limits<uint64_t>::max());
  } else {
    words.expect("figure");
    change.kind = WorldChange::Kind::Figure;
    change.name = words.text("the figure's name");
    change.value = words.text("the figure's value");
  }
  return change;
}

TraceStep::Action readPointer(TraceWords& words, BrimolEventType type) {
  const auto finger = static_cast<int>(words.number("a finger", Pointers::kFingers - 1));
  const auto x = static_cast<int>(words.number("a position", kMostPixels));
  const auto y = static_cast<int>(words.number("a position", kMostPixels));
  RawRecord raw = {pointerRecord(type, finger, {x, y})};
  if (type != BRIMOL_POINTER_MOTION) return raw;
  raw.record.pointer.xrel = static_cast<int16_t>(words.signedNumber("a motion", kMostMotion));
  raw.record.pointer.yrel = static_cast<int16_t>(words.signedNumber("a motion", kMostMotion));
  return raw;
}

template <BrimolEventType kType>
TraceStep::Action readFingerRecord(TraceWords& words) {
  return readPointer(words, kType);
}

template <BrimolEventType kType>
TraceStep::Action readKeyRecord(TraceWords& words) {
  return RawRecord{
      keyRecord(kType, static_cast<uint32_t>(words.number("a key's code", kMostWord)))};
}

TraceStep::Action readUserRecord(TraceWords& words) {
  const auto first = static_cast<uint32_t>(words.number("a word", kMostWord));
  return RawRecord{userRecord(first, static_cast<uint32_t>(words.number("a word", kMostWord)))};
}

struct StepRow {
  std::string_view word;
  TraceStep::Action (*read)(TraceWords& words);
};
constexpr auto kSteps = std::to_array<StepRow>({
    {"tap", readTap},
    {"press", readPress},
    {"move", readMove},
    {"release", readRelease},
    {"drag", readDrag},
    {"key", readKey},
    {"type", readType},
    {"expect", readExpect},
    {"wait", readWait},
    {"shot", readShot},
    {"world", readWorld},
    {"close", [](TraceWords&) -> TraceStep::Action { return CloseWish{}; }},
    {"end", [](TraceWords&) -> TraceStep::Action { return SessionEnd{}; }},
    {"down", readFingerRecord<BRIMOL_POINTER_DOWN>},
    {"up", readFingerRecord<BRIMOL_POINTER_UP>},
    {"motion", readFingerRecord<BRIMOL_POINTER_MOTION>},
    {"long", readFingerRecord<BRIMOL_LONG_PRESS>},
    {"keydown", readKeyRecord<BRIMOL_KEY_DOWN>},
    {"keyup", readKeyRecord<BRIMOL_KEY_UP>},
    {"user", readUserRecord},
});

[[noreturn]] void refuseTime(const std::string& text) {
  throw BadLine{"'" + text + "' is not a time as 2026-11-22T10:00:00.000Z"};
}

}  // namespace

TraceStep::Action readStep(TraceWords& words) {
  const std::string word = words.word("a step");
  const auto* const row = std::ranges::find(kSteps, word, &StepRow::word);
  if (row == kSteps.end()) throw BadLine{"unknown step '" + word.substr(0, 40) + "'"};
  TraceStep::Action action = row->read(words);
  words.expectEnd();
  return action;
}

uint64_t readUtc(const std::string& text) {
  constexpr uint64_t kSecond = 1000;
  constexpr std::size_t kFractionBytes = 5;  // ".000Z"
  std::tm parts = {};
  const char* const rest = ::strptime(text.c_str(), "%Y-%m-%dT%H:%M:%S", &parts);
  const std::time_t seconds = rest == nullptr ? -1 : ::timegm(&parts);
  if (seconds < 0) refuseTime(text);
  const uint64_t whole = static_cast<uint64_t>(seconds) * kSecond;
  std::string written = utcText(whole);
  if (text == written.erase(written.size() - kFractionBytes) + "Z") return whole;
  std::string fraction = rest;
  if (fraction.size() != kFractionBytes || !fraction.ends_with('Z')) refuseTime(text);
  fraction.pop_back();
  const uint64_t ms =
      whole + TraceWords(fraction.substr(1)).number("a part of a second", kSecond - 1);
  if (text != utcText(ms)) refuseTime(text);
  return ms;
}

std::string utcText(uint64_t ms) {
  constexpr uint64_t kSecond = 1000;
  const auto seconds = static_cast<std::time_t>(ms / kSecond);
  std::tm parts = {};
  ::gmtime_r(&seconds, &parts);
  std::array<char, 64> text = {};
  const std::size_t length = std::strftime(text.data(), text.size(), "%Y-%m-%dT%H:%M:%S.", &parts);
  const std::string fraction = std::to_string(kSecond + ms % kSecond).substr(1);
  return std::string(text.data(), length) + fraction + "Z";
}

}  // namespace brimol::pc
