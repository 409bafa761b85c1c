#include "session.h"

#include <algorithm>
#include <array>
#include <bit>
#include <fstream>
#include <iterator>
#include <limits>
#include <nlohmann/json.hpp>

namespace brimol::replay {

namespace {

using nlohmann::json;
using Kind = Happening::Kind;
using Weight = Happening::Weight;

constexpr int64_t kMostTime = int64_t{1} << 50;  // a double holds it without loss
constexpr int kMicrosecondsPerMs = 1000;

// Members of an object. One that is missing or of another type reads as empty or 0.

const json& memberOf(const json& object, const char* name) {
  static const json null;
  const auto found = object.find(name);
  return found == object.end() ? null : *found;
}

std::string textOf(const json& value) {
  return value.is_string() ? value.get<std::string>() : std::string();
}

std::string textIn(const json& object, const char* name) { return textOf(memberOf(object, name)); }

int64_t timeIn(const json& object, const char* name) {
  const json& value = memberOf(object, name);
  if (!value.is_number()) return 0;
  const auto number = value.get<double>();
  return static_cast<int64_t>(
      std::clamp(number, -static_cast<double>(kMostTime), static_cast<double>(kMostTime)));
}

int numberIn(const json& object, const char* name) {
  constexpr int64_t kLeast = std::numeric_limits<int>::min();
  constexpr int64_t kMost = std::numeric_limits<int>::max();
  return static_cast<int>(std::clamp(timeIn(object, name), kLeast, kMost));
}

bool isTrueIn(const json& object, const char* name) { return memberOf(object, name) == true; }

SessionStart startOf(const json& line) {
  SessionStart start;
  start.program = textIn(line, "program");
  start.version = textIn(line, "version");
  start.display = textIn(line, "display");
  start.clock = textIn(line, "clock");
  start.utc = textIn(line, "utc");
  const json& screen = memberOf(line, "screen");
  start.width = std::max(numberIn(screen, "width"), 0);
  start.height = std::max(numberIn(screen, "height"), 0);
  const json& density = memberOf(screen, "density");
  if (density.is_number()) start.density = density.get<float>();
  const json& environment = memberOf(line, "environment");
  if (!environment.is_object()) return start;
  for (const auto& [name, value] : environment.items()) start.environment[name] = textOf(value);
  return start;
}

// The numbers of a list, as many as are wanted; one that is missing or no whole number is 0.
template <std::size_t count>
std::array<int32_t, count> wordsIn(const json& object, const char* name) {
  std::array<int32_t, count> words = {};
  const json& list = memberOf(object, name);
  for (std::size_t i = 0; i < count && list.is_array() && i < list.size(); ++i) {
    if (list[i].is_number_integer()) words[i] = static_cast<int32_t>(list[i].get<int64_t>());
  }
  return words;
}

SKIA_Item itemOf(const json& object) {
  SKIA_Item item = {numberIn(object, "kind"), {}, {}, {}};
  item.rect = std::bit_cast<SKIA_Rect>(wordsIn<5>(object, "rect"));
  item.point = std::bit_cast<SKIA_Point>(wordsIn<6>(object, "line"));
  const auto [color, align, size] = wordsIn<3>(object, "font");
  item.text = {{}, 0, static_cast<uint32_t>(color), align, size};
  const auto length = textIn(object, "text").copy(item.text.text, SKIA_TEXT_BYTES - 1);
  item.text.string_len = static_cast<int32_t>(length);
  return item;
}

Frame frameOf(const json& line) {
  Frame frame;
  frame.number = numberIn(line, "number");
  frame.time = timeIn(line, "time");
  frame.hash = textIn(line, "hash");
  frame.items = numberIn(line, "items");
  frame.picture = textIn(line, "picture");
  frame.paintMs = static_cast<double>(timeIn(line, "paint_us")) / kMicrosecondsPerMs;
  if (const json& drawn = memberOf(line, "drawn"); drawn.is_array()) {
    std::ranges::transform(drawn, std::back_inserter(frame.drawn), itemOf);
  }
  const json& texts = memberOf(line, "texts");
  if (!texts.is_array()) return frame;
  for (const json& text : texts) frame.texts.push_back(textIn(text, "text"));
  return frame;
}

// The words of each kind.

void readStep(const json& line, Happening& step) { step.text = textIn(line, "text"); }

void readEvent(const json& line, Happening& event) {
  event.input = event.text = textIn(line, "input");
  if (line.contains("code")) event.text.append(" ").append(std::to_string(numberIn(line, "code")));
  if (!line.contains("x") || !line.contains("y")) return;
  event.touch = {numberIn(line, "x"), numberIn(line, "y")};
  event.text += ": finger " + std::to_string(numberIn(line, "finger")) + " at " +
                std::to_string(event.touch->x) + ", " + std::to_string(event.touch->y);
}

void readLog(const json& line, Happening& log) {
  constexpr int kDebug = 3;
  constexpr int kWarning = 5;
  log.text = textIn(line, "tag") + ": " + textIn(line, "message");
  const int priority = numberIn(line, "priority");
  log.isDetail = priority <= kDebug;
  if (priority == kWarning) log.weight = Weight::Warning;
  if (priority > kWarning) log.weight = Weight::Failure;
}

void readExpectation(const json& line, Happening& expectation) {
  expectation.text = textIn(line, "text");
  expectation.why = textIn(line, "why");
  expectation.passed = isTrueIn(line, "passed");
  if (!expectation.passed) expectation.weight = Weight::Failure;
}

void readShot(const json& line, Happening& shot) {
  shot.text = shot.picture = textIn(line, "picture");
}

void readWorld(const json& line, Happening& world) {
  world.text = textIn(line, "name") + " = " + textIn(line, "value");
}

// The message names the line once more.
void readError(const json& line, Happening& error) {
  error.text = textIn(line, "message");
  const std::string place = error.place.text() + ": ";
  if (error.text.starts_with(place)) error.text.erase(0, place.size());
  error.weight = Weight::Failure;
}

void readBlocked(const json& line, Happening& blocked) {
  const std::string id =
      memberOf(line, "id").is_string() ? textIn(line, "id") : std::to_string(timeIn(line, "id"));
  blocked.text = "thread " + textIn(line, "thread") + " (" + id + ") blocks outside the platform";
  blocked.weight = Weight::Warning;
}

struct KindRow {
  std::string_view name;
  Kind kind;
  void (*read)(const json& line, Happening& happening);
};
constexpr auto kKinds = std::to_array<KindRow>({
    {"step", Kind::Step, readStep},
    {"event", Kind::Event, readEvent},
    {"log", Kind::Log, readLog},
    {"expectation", Kind::Expectation, readExpectation},
    {"shot", Kind::Shot, readShot},
    {"world", Kind::World, readWorld},
    {"error", Kind::Error, readError},
    {"blocked", Kind::Blocked, readBlocked},
});

// A failed expectation is an error of the session, too, and is told once.
bool repeatsFailure(const Session& session, const Happening& happening) {
  if (happening.kind != Kind::Error || session.happenings.empty()) return false;
  const Happening& last = session.happenings.back();
  return !last.passed && last.place == happening.place;
}

// False: the kind is not known.
bool addHappening(const json& line, const std::string& kind, Session& session) {
  const auto* const row = std::ranges::find(kKinds, kind, &KindRow::name);
  if (row == kKinds.end()) return false;
  Happening happening;
  happening.kind = row->kind;
  happening.time = timeIn(line, "time");
  happening.frames = session.frames.size();
  happening.place = {textIn(line, "file"), numberIn(line, "line")};
  row->read(line, happening);
  if (!repeatsFailure(session, happening)) session.happenings.push_back(std::move(happening));
  return true;
}

// What a session went on after did not make it fail.
void forgiveErrors(Session& session) {
  for (Happening& happening : session.happenings) {
    if (happening.kind == Kind::Error) happening.weight = Weight::Warning;
  }
}

bool addObject(const json& line, const std::string& kind, Session& session) {
  session.lastTime = std::max(session.lastTime, timeIn(line, "time"));
  if (kind == "start") {
    session.start = startOf(line);
  } else if (kind == "frame") {
    session.frames.push_back(frameOf(line));
  } else if (kind == "end") {
    session.end = {timeIn(line, "time"), numberIn(line, "exit"), textIn(line, "reason")};
    if (session.end->reason == "closed") forgiveErrors(session);
  } else {
    return addHappening(line, kind, session);
  }
  return true;
}

}  // namespace

std::string Place::text() const {
  return file.empty() ? std::string() : file + ":" + std::to_string(line);
}

void SessionReader::add(std::string_view bytes) {
  for (auto end = bytes.find('\n'); end != std::string_view::npos; end = bytes.find('\n')) {
    rest += bytes.substr(0, end);
    addLine(rest);
    rest.clear();
    bytes.remove_prefix(end + 1);
  }
  rest += bytes;
}

void SessionReader::finish() {
  if (!rest.empty()) addLine(rest);
  rest.clear();
}

void SessionReader::addLine(std::string_view line) {
  ++read.lines;
  const json object = json::parse(line, nullptr, false);  // without exceptions
  const std::string kind = textIn(object, "kind");
  if (kind.empty()) {
    if (read.damaged++ == 0) read.firstDamaged = read.lines;
  } else if (!addObject(object, kind, read)) {
    ++read.unknown;
  }
}

Session readSession(const std::string& path) {
  std::ifstream file(path, std::ios::binary);
  SessionReader reader;
  std::array<char, 1 << 16> bytes{};
  while (file.read(bytes.data(), std::ssize(bytes)) || file.gcount() > 0) {
    reader.add({bytes.data(), static_cast<std::size_t>(file.gcount())});
  }
  reader.finish();
  return reader.session();
}

}  // namespace brimol::replay
