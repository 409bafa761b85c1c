#include "host/session_report.h"

#include <unistd.h>

#include <array>
#include <cstdio>
#include <fstream>
#include <iostream>
#include <nlohmann/json.hpp>
#include <sstream>
#include <string_view>
#include <system_error>
#include <utility>

#include "host/png_file.h"
#include "input/trace_recorder.h"
#include "input/trace_steps.h"
#include "scene/item.h"
#include "scene/item_text.h"
#include "scene/quoted_text.h"
#include "scene/shown_texts.h"

namespace brimol::pc {

namespace {

using nlohmann::ordered_json;

constexpr int kFormat = 1;

void put(LineFile& file, const ordered_json& line) {
  file.write(line.dump(-1, ' ', false, ordered_json::error_handler_t::replace));
}

std::filesystem::path fileIn(const std::filesystem::path& folder) {
  std::error_code failure;  // that the file cannot be written says it
  std::filesystem::create_directories(folder, failure);
  return folder / "session.jsonl";
}

ordered_json lineOf(const char* kind, uint64_t time) { return {{"kind", kind}, {"time", time}}; }

void addPlace(ordered_json& line, const TraceLine* place) {
  if (place == nullptr || place->file == nullptr) return;
  line["file"] = place->file->path;
  line["line"] = place->number;
}

ordered_json orNull(const std::string& text) {
  return text.empty() ? ordered_json() : ordered_json(text);
}

std::vector<std::string> argumentsOfProcess() {
  std::ifstream in("/proc/self/cmdline", std::ios::binary);
  std::vector<std::string> arguments;
  for (std::string each; std::getline(in, each, '\0');) arguments.push_back(each);
  if (!arguments.empty()) arguments.erase(arguments.begin());
  return arguments;
}

ordered_json environmentOfProcess() {
  constexpr std::string_view kPrefix = "BRIMOL_";
  ordered_json variables = ordered_json::object();
  for (char* const* each = environ; *each != nullptr; ++each) {
    const std::string_view variable = *each;
    const std::size_t equals = variable.find('=');
    if (!variable.starts_with(kPrefix) || equals == std::string_view::npos) continue;
    variables[std::string(variable.substr(0, equals))] = variable.substr(equals + 1);
  }
  return variables;
}

uint64_t utcNow() {
  using std::chrono::duration_cast;
  using std::chrono::milliseconds;
  const auto since1970 = std::chrono::system_clock::now().time_since_epoch();
  return static_cast<uint64_t>(duration_cast<milliseconds>(since1970).count());
}

std::string pictureName(int number) {
  std::array<char, 32> name = {};
  std::snprintf(name.data(), name.size(), "frame-%06d.png", number);
  return name.data();
}

const char* nameOf(ClockChoice clock) {
  switch (clock) {
    case ClockChoice::Simulated: return "simulated";
    case ClockChoice::Paced: return "paced";
    case ClockChoice::Real: break;
  }
  return "real";
}

ordered_json wordsOf(const SKIA_Item& item) {
  const auto& [x, y, w, h, ground] = item.rect;
  const auto& [x1, y1, x2, y2, color, width] = item.point;
  return {{"kind", item.kind},
          {"rect", {x, y, w, h, ground}},
          {"line", {x1, y1, x2, y2, color, width}},
          {"text", shownText(item.text)},
          {"font", {item.text.color, item.text.align, item.text.size}}};
}

}  // namespace

SessionReport::SessionReport(std::filesystem::path where, std::string& error)
    : folder(std::move(where)), file(fileIn(folder), error) {
  if (!error.empty()) {
    error = "BRIMOL_REPORT_DIR=" + printable(folder.native()) + ": cannot be written";
  }
}

void SessionReport::start(const SessionSettings& settings, const SessionScreen& screen,
                          uint32_t clockStart) {
  listsItems = settings.listsItems;
  std::error_code failure;
  ordered_json line = lineOf("start", 0);
  line["format"] = kFormat;
  line["program"] = std::filesystem::read_symlink("/proc/self/exe", failure).native();
  line["arguments"] = argumentsOfProcess();
  line["version"] = BRIMOL_VERSION;
  line["screen"] = {
      {"width", screen.size.w}, {"height", screen.size.h}, {"density", screen.density}};
  line["display"] = screen.display;
  line["clock"] = nameOf(settings.clock);
  line["clock_start"] = clockStart;
  line["trace"] = orNull(settings.trace);
  line["record"] = orNull(settings.recording);
  line["utc"] = utcText(utcNow());
  line["environment"] = environmentOfProcess();
  put(file, line);
}

void SessionReport::step(uint64_t time, const TraceLine& place) {
  ordered_json line = lineOf("step", time);
  addPlace(line, &place);
  line["text"] = place.text;
  put(file, line);
}

void SessionReport::event(uint64_t time, const Event& record, const TraceLine* place) {
  ordered_json line = lineOf("event", time);
  std::istringstream words(textOfRecord(record));
  std::string name;
  words >> name;
  line["input"] = name;
  if (record.type == BRIMOL_KEY_DOWN || record.type == BRIMOL_KEY_UP) {
    line["code"] = record.key.code;
  } else {
    line["finger"] = record.pointer.finger;
    line["x"] = record.pointer.x;
    line["y"] = record.pointer.y;
  }
  addPlace(line, place);
  put(file, line);
}

void SessionReport::close(uint64_t time, const TraceLine* place) {
  ordered_json line = lineOf("event", time);
  line["input"] = "close";
  addPlace(line, place);
  put(file, line);
}

void SessionReport::frame(const SessionFrame& shown, Size screen, cairo_surface_t* picture,
                          int64_t paintUs) {
  ordered_json line = lineOf("frame", shown.time);
  line["number"] = shown.number;
  line["hash"] = hashText(hashOf(shown.items));
  line["items"] = shown.items.size();
  line["texts"] = ordered_json::array();
  for (const auto& [text, area, item] : shownTexts(shown.frame, screen)) {
    line["texts"].push_back(
        {{"text", text}, {"x", area.x}, {"y", area.y}, {"w", area.width}, {"h", area.height}});
  }
  if (listsItems) {
    line["drawn"] = ordered_json::array();
    for (const SKIA_Item& item : shown.frame) line["drawn"].push_back(wordsOf(item));
  }
  line["picture"] = picture == nullptr ? ordered_json() : nameOfWritten(*picture, shown.number);
  line["paint_us"] = paintUs;
  put(file, line);
}

ordered_json SessionReport::nameOfWritten(cairo_surface_t& picture, int number) {
  const std::string name = pictureName(number);
  const std::string problem = writePng(&picture, folder / name);
  if (problem.empty()) return name;
  if (!std::exchange(lacksPictures, true)) std::cerr << "brimol: " << problem << '\n';
  return {};
}

void SessionReport::log(uint64_t time, int priority, const char* tag, const char* message) {
  ordered_json line = lineOf("log", time);
  line["priority"] = priority;
  line["tag"] = tag;
  line["message"] = message;
  put(file, line);
}

void SessionReport::expectation(uint64_t time, const TraceLine& place, const std::string& why) {
  ordered_json line = lineOf("expectation", time);
  addPlace(line, &place);
  line["text"] = place.text;
  line["passed"] = why.empty();
  line["why"] = why;
  put(file, line);
}

void SessionReport::shot(uint64_t time, const TraceLine& place, const std::string& picture) {
  ordered_json line = lineOf("shot", time);
  addPlace(line, &place);
  line["picture"] = picture;
  put(file, line);
}

void SessionReport::world(uint64_t time, const std::string& name, const std::string& value) {
  ordered_json line = lineOf("world", time);
  line["name"] = name;
  line["value"] = value;
  put(file, line);
}

void SessionReport::blocked(uint64_t time, const std::string& name, pid_t thread) {
  ordered_json line = lineOf("blocked", time);
  line["thread"] = name;
  line["id"] = thread;
  put(file, line);
}

void SessionReport::error(uint64_t time, const std::string& message, const TraceLine* place) {
  ordered_json line = lineOf("error", time);
  line["message"] = message;
  addPlace(line, place);
  put(file, line);
}

void SessionReport::end(uint64_t time, int exitCode, const char* reason) {
  ordered_json line = lineOf("end", time);
  line["exit"] = exitCode;
  line["reason"] = reason;
  put(file, line);
}

}  // namespace brimol::pc
