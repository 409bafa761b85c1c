/// The file that a tool reads of a session. docs/traces.md describes it.
#pragma once

#include <cairo.h>

#include <cstdint>
#include <filesystem>
#include <nlohmann/json_fwd.hpp>
#include <string>
#include <vector>

#include "host/session_settings.h"
#include "input/line_file.h"
#include "input/trace.h"
#include "scene/scene.h"

namespace brimol::pc {

/// A changed frame of a session.
struct SessionFrame {
  uint64_t time;
  int number;  // from 1
  const Frame& frame;
  const std::vector<std::string>& items;
};

/// The screen of a session, known before it opens.
struct SessionScreen {
  Size size = {};
  float density = 0;  // dots per inch
  const char* display = "";
};

/// Writes into a folder that it makes, each line when it happens. Not guarded: Session is. Times
/// are milliseconds since the start.
class SessionReport {
 public:
  /// `error` says in one line why the folder cannot be used.
  SessionReport(std::filesystem::path where, std::string& error);

  void start(const SessionSettings& settings, const SessionScreen& screen, uint32_t clockStart);
  void step(uint64_t time, const TraceLine& place);
  void event(uint64_t time, const Event& record, const TraceLine* place);
  void close(uint64_t time, const TraceLine* place);
  /// `picture` is written beside the file; null: none. The first that cannot be written is told of
  /// in a line on standard error, and the session goes on.
  void frame(const SessionFrame& shown, Size screen, cairo_surface_t* picture, int64_t paintUs);
  void log(uint64_t time, int priority, const char* tag, const char* message);
  void expectation(uint64_t time, const TraceLine& place, const std::string& why);
  void shot(uint64_t time, const TraceLine& place, const std::string& picture);
  void world(uint64_t time, const std::string& name, const std::string& value);
  void blocked(uint64_t time, const std::string& name, pid_t thread);
  void error(uint64_t time, const std::string& message, const TraceLine* place);
  void end(uint64_t time, int exitCode, const char* reason);

  const std::filesystem::path& directory() const { return folder; }

 private:
  // Null where it could not be written.
  nlohmann::ordered_json nameOfWritten(cairo_surface_t& picture, int number);

  std::filesystem::path folder;
  LineFile file;
  bool listsItems = false;
  bool lacksPictures = false;
};

}  // namespace brimol::pc
