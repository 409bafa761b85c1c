/// What a session's file says: docs/traces.md describes it.
#pragma once

#include <brimol/scene.h>

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace brimol::replay {

/// A line of a trace. No file: the session did not name one.
struct Place {
  std::string file = {};
  int line = 0;

  /// "FILE:LINE", or nothing.
  std::string text() const;
  bool operator==(const Place&) const = default;
};

struct SessionStart {
  std::string program, version, screen, display, clock, utc;
  int width = 0, height = 0;  // of the screen; 0 if the session did not say
  float density = 0;          // dots per inch; 0 if the session did not say
  std::map<std::string, std::string> environment;
};

struct Frame {
  int number = 0;
  int64_t time = 0;  // as all times here: ms since the session's start
  std::string hash = {};
  int items = 0;
  std::vector<std::string> texts = {};
  std::vector<SKIA_Item> drawn = {};  // empty if the session does not list them
  std::string picture = {};           // a file in the session's folder
  double paintMs = 0;
};

struct Touch {
  int x = 0, y = 0;
  bool operator==(const Touch&) const = default;
};

/// Anything that happened apart from frames.
struct Happening {
  enum class Kind { Step, Event, Log, Expectation, Shot, World, Error, Blocked };
  enum class Weight { Plain, Warning, Failure };

  Kind kind = Kind::Step;
  int64_t time = 0;
  std::size_t frames = 0;  // how many came before it
  Place place = {};
  std::string text = {};            // in words
  std::string why = {};             // of an expectation that failed
  std::string picture = {};         // of a shot
  std::string input = {};           // of an event: "down", "motion", ...
  std::optional<Touch> touch = {};  // where a finger was
  Weight weight = Weight::Plain;
  bool isDetail = false;  // of a log line: for developers of the toolkit
  bool passed = true;     // of an expectation
};

struct SessionEnd {
  int64_t time = 0;
  int exit = 0;
  std::string reason;
};

struct Session {
  std::optional<SessionStart> start;
  std::vector<Frame> frames;
  std::vector<Happening> happenings;
  std::optional<SessionEnd> end;
  int64_t lastTime = 0;
  int lines = 0;         // whole ones, good or bad
  int damaged = 0;       // lines that are no JSON object with a kind
  int firstDamaged = 0;  // the first one's number
  int unknown = 0;       // lines of a kind that is not known here

  bool wasRead() const { return lines > damaged; }
};

/// Reads a session's file as it grows. Nothing in it is refused: what cannot be understood is
/// counted and left out.
class SessionReader {
 public:
  /// The next bytes, cut anywhere.
  void add(std::string_view bytes);
  /// There are no more: a last line without its end is read if it is whole, and damaged otherwise.
  void finish();
  const Session& session() const { return read; }

 private:
  void addLine(std::string_view line);

  Session read;
  std::string rest;  // what is no whole line yet
};

/// The file's session; one without lines if it cannot be opened.
Session readSession(const std::string& path);

}  // namespace brimol::replay
