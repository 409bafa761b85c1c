/// What a trace file says. docs/traces.md describes the file.
#pragma once

#include <brimol/input.h>

#include <cstdint>
#include <deque>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "scene/geometry.h"
#include "scene/shown_texts.h"

namespace brimol::pc {

/// The trace, or what it includes.
struct TraceFile {
  std::string path;
  std::string text;
};

/// Lives as long as its trace, which holds the files.
struct TraceLine {
  const TraceFile* file = nullptr;  // null: there is no such line
  int number = 0;                   // from 1
  std::string_view text = {};       // as it is written, without blanks at its ends
  /// "FILE:LINE".
  std::string place() const { return file->path + ':' + std::to_string(number); }
};

/// Pixels, or hundredths of per cent of the screen's side.
struct Coordinate {
  int value = 0;
  bool isPart = false;
  int pixels(int side) const;
};

/// A position, or the middle of the item that shows a text.
struct Place {
  Coordinate x;
  Coordinate y;
  std::optional<TextPattern> text;
};

struct SearchArea {
  Coordinate x;
  Coordinate y;
  Coordinate w;
  Coordinate h;
};

// The steps. Durations are milliseconds.

struct Touch {
  enum class Kind { Tap, Press, Move, MoveBy, Release, Drag };
  Kind kind = Kind::Tap;
  Place place;  // MoveBy: the distance
  Place to;     // Drag
  uint32_t duration = 0;
  int finger = 0;
};
struct KeyStroke {
  enum class Kind { Stroke, Down, Up };
  Kind kind = Kind::Stroke;
  uint32_t code = 0;
  uint32_t duration = 0;
};
struct Typing {
  std::string text;
};
struct Look {
  enum class Subject { Text, NoText, Pixel, Log, NoLog };
  Subject subject = Subject::Text;
  TextPattern pattern;
  std::optional<SearchArea> area;
  Coordinate x;
  Coordinate y;
  uint32_t colour = 0;  // 0x00RRGGBB
  uint32_t within = 0;
};
struct Pause {
  uint32_t duration = 0;
};
struct Shot {
  std::string file;
};
struct WorldChange {
  enum class Kind { Time, Random, Figure };
  Kind kind = Kind::Time;
  uint64_t number = 0;  // milliseconds since 1970, or the seed
  std::string name;
  std::string value;
};
struct RawRecord {
  Event record = {};
};
struct CloseWish {};
struct SessionEnd {};

struct TraceStep {
  enum class Timing { AsSoonAsPossible, At, After };
  using Action = std::variant<Touch, KeyStroke, Typing, Look, Pause, Shot, WorldChange, RawRecord,
                              CloseWish, SessionEnd>;
  TraceLine line;
  Timing timing = Timing::AsSoonAsPossible;
  uint64_t time = 0;  // since the start, or since the step before was done
  Action action;
};

struct ItemChange {
  std::size_t number;
  std::string_view item;  // as TraceLine's text
  friend bool operator==(const ItemChange&, const ItemChange&) = default;
};

/// A frame as it differs from the one before: a trace that says "65536 items" a thousand times does
/// not take up what these would.
struct RecordedFrame {
  TraceLine line;
  uint64_t time = 0;
  uint64_t hash = 0;
  std::size_t count = 0;              // of its items
  std::vector<ItemChange> changes{};  // of the items of the frame before
  bool isForgotten = false;           // what its items are is not known
};

struct Trace {
  std::vector<std::shared_ptr<const TraceFile>> files;  // the trace itself first
  bool isRecording = false;
  bool leavesRunning = false;
  uint64_t lingerMs = 0;  // from the last step's end to the wish to close
  std::string cutAt;      // a recording without an end: where it stops, for the user
  std::optional<Size> screen;
  TraceLine screenLine;
  std::optional<float> density;  // dots per inch
  TraceLine densityLine;
  std::optional<uint32_t> clockStart;
  std::optional<uint32_t> clockStep;
  std::deque<TraceStep> steps;
  std::deque<RecordedFrame> frames;
};

/// The items of a recorded frame; empty texts where they are not known.
std::vector<std::string> itemsOf(const Trace& trace, std::size_t frame);

}  // namespace brimol::pc
