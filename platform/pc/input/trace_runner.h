/// Plays a trace.
#pragma once

#include <cstdint>
#include <deque>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "input/script_fingers.h"
#include "input/trace.h"
#include "scene/scene.h"

namespace brimol::pc {

/// What a trace acts on.
struct TraceStage {
  Size screen;
  std::function<void(const Event& record)> post;
  std::function<void()> close;                                // the user asks to close
  std::function<std::optional<uint32_t>(ScreenPoint)> pixel;  // 0x00RRGGBB; none: no picture
  std::function<std::string(const std::string& file)> shoot;  // what went wrong, or nothing
  std::function<void(const WorldChange& change)> changeWorld;
  std::function<void(const TraceLine& line)> begin;                          // a step begins
  std::function<void(const TraceLine& line, const std::string& why)> judge;  // empty: it passed
};

/// The lines at the head of a trace that say what the world is at the start.
std::vector<WorldChange> worldAtStart(const Trace& trace);

/// Why a session failed: the line that is to blame, and what is wrong, in one line or several.
struct TraceFailure {
  TraceLine line;
  std::string why;
};

/// A state machine: it is told what time it is and what the application shows and logs, and acts on
/// its stage. It reads no clock, and knows no thread: one call at a time. `trace` outlives it. What
/// the world is at the start is not its matter.
class TraceRunner {
 public:
  TraceRunner(const Trace& played, TraceStage target);

  /// When act() is to be called next, in milliseconds since the start; none: not by itself. What
  /// is due because of what was seen is due at `soonest`.
  std::optional<uint64_t> due(uint64_t soonest) const;
  void act(uint64_t now);

  /// A frame was ended that differs from the one before.
  void seeFrame(uint64_t now, const Frame& shown, const std::vector<std::string>& items);
  void seeLog(const std::string& line);
  /// The application closed its screen.
  void seeEnd();

  /// Set once, by any of these; the runner does nothing from then on.
  const std::optional<TraceFailure>& failure() const { return failed; }
  /// All steps are done.
  bool isOver() const { return next == trace.steps.size(); }
  const Frame& frame() const { return newest; }

 private:
  enum class Outcome { Done, Later };  // Later: something is planned, or to be looked at again
  struct Planned {
    uint64_t time;
    std::function<void(uint64_t now)> action;
  };
  struct Motion {
    int finger;
    ScreenPoint from;
    ScreenPoint to;
    uint64_t start;
    uint32_t duration;
  };

  const TraceStep& step() const { return trace.steps[next]; }
  std::optional<uint64_t> startOfStep() const;
  uint64_t endOfTrace() const { return stepDone.value_or(0) + restMs + trace.lingerMs; }
  bool advance(uint64_t now);
  bool begin(uint64_t now);
  void finishStep(uint64_t now);
  void finishTrace(uint64_t now);
  void fail(const std::string& why);
  void fail(const TraceLine& line, const std::string& why);
  void plan(uint64_t time, std::function<void(uint64_t now)> action);

  Outcome attempt(const Touch& touch, uint64_t now);
  Outcome attempt(const KeyStroke& stroke, uint64_t now);
  Outcome attempt(const Typing& typing, uint64_t now);
  Outcome attempt(const Look& look, uint64_t now);
  Outcome attempt(const Pause& pause, uint64_t now);
  Outcome attempt(const Shot& shot, uint64_t now);
  Outcome attempt(const WorldChange& change, uint64_t now) const;
  Outcome attempt(const RawRecord& raw, uint64_t now) const;
  Outcome attempt(const CloseWish& wish, uint64_t now) const;
  Outcome attempt(const SessionEnd& end, uint64_t now);

  Outcome lookAgainUntil(uint64_t deadline, uint64_t now, const std::string& why);
  std::optional<ScreenPoint> find(const Place& place, std::string& why) const;
  std::optional<ScreenPoint> findKey(const std::string& text, std::string& why) const;
  static std::optional<ScreenPoint> pick(const std::vector<ShownText>& texts,
                                         const TextPattern& wanted, std::string& why);
  void planTouch(const Touch& touch, ScreenPoint place, ScreenPoint to, uint64_t now);
  Planned moveStep(const Motion& motion, int number);
  std::string whyNot(const Look& look);
  void compareFrame(uint64_t now, const std::vector<std::string>& items);
  void missFrames(uint64_t now);

  const Trace& trace;
  TraceStage stage;
  ScriptFingers fingers;

  std::size_t next = 0;               // the step that runs, or is to begin
  std::optional<uint64_t> begun;      // when it did
  std::optional<uint64_t> lookUntil;  // it looks for something
  bool hasActed = false;              // all that it does is planned
  std::size_t typed = 0;              // bytes of a text to type
  int shifts = 0;                     // taps on the shift key for the same character
  std::deque<Planned> planned;
  std::optional<uint64_t> stepDone;  // when the step before was; none before the first frame
  uint64_t restMs = 0;               // what passes before a step without a time
  std::optional<uint64_t> closedBy;  // when the application is to have ended

  Frame newest;
  std::size_t frames = 0;  // seen so far
  std::vector<std::string> log;
  std::size_t logRead = 0;  // lines up to the one that the last look found
  bool hasSeen = false;     // something since the last look
  uint64_t present = 0;
  std::optional<TraceFailure> failed;
};

/// Each line with its number, the two lists side by side where they differ.
std::string differenceOf(const std::vector<std::string>& recorded,
                         const std::vector<std::string>& played);

}  // namespace brimol::pc
