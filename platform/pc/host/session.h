/// The played or recorded session of the process: its clock, its trace, its report.
#pragma once

#include <atomic>
#include <memory>
#include <mutex>
#include <optional>
#include <string>
#include <vector>

#include "clock/turn_clock.h"
#include "host/memory_watch.h"
#include "host/session_report.h"
#include "host/session_settings.h"
#include "host/world.h"
#include "input/monkey.h"
#include "input/trace_parser.h"
#include "input/trace_recorder.h"
#include "input/trace_runner.h"

namespace brimol::pc {

class Platform;

/// Begins with the process's first call of the platform, if the environment asks for anything but a
/// real clock without a trace and a report; ends when the screen closes for the first time. From
/// then on its clock alone goes on. It lives as long as the process. Any thread.
class Session {
 public:
  explicit Session(SessionSettings wanted);
  Session(const Session&) = delete;
  Session& operator=(const Session&) = delete;

  /// Null: time is real.
  TurnClock* clock() { return turns ? &*turns : nullptr; }

  /// What the environment asks, or else the trace.
  Size screen() const { return screenSize; }
  float dotsPerInch() const { return density; }
  /// The screen is about to open. One line that says why it cannot; a trace that cannot be played
  /// ends the process.
  std::string prepare();
  /// It did not open.
  void giveUp();
  /// It has opened.
  void begin(Platform& platform);
  /// It is about to close.
  void close();

  /// A frame was ended, on the thread that drew it. Returns when its picture is painted, if that is
  /// kept.
  void frame(Platform& platform, Frame& shown);
  /// What the display reports of the user: for the recording, or nothing.
  void userInput(const Event& record);
  void userCloses();
  /// What the application is told, instead of what the display says.
  std::optional<bool> isCloseRequested() const;
  void log(int priority, const char* tag, const char* message);

  // What an application asks of the world; nothing where the real one answers.

  std::optional<uint64_t> utcMs();
  std::optional<uint32_t> random();
  std::optional<std::string> figure(const std::string& name, const std::string& real);

 private:
  struct Arrival {
    Event record;
    bool isClose;
  };

  bool isPlaying() const { return !settings.trace.empty(); }
  // By a monkey or a trace, and not by the display's user.
  bool isDriven() const { return isPlaying() || settings.monkey; }
  bool isRecording() const { return !settings.recording.empty(); }
  void startClock();
  void startRecording();
  void recordWorld();
  void startMonkey();
  void takeScreen();
  void takeDensity(const Settings& wanted);
  void startReport();
  TraceStage stage();
  std::optional<uint64_t> due(uint64_t soonest);
  void act(uint64_t moment);
  void followMonkey(uint64_t moment);
  void tellOfMonkey();
  void takeArrivals(uint64_t moment);
  void deliver(const Event& record);
  void askToClose();
  uint64_t now() const { return turns ? turns->now() : 0; }
  std::optional<uint32_t> pixel(ScreenPoint place);
  std::string shoot(const std::string& file);
  void showWorld(const std::string& name, const std::string& value);
  void tellBlocked(const std::string& name, pid_t thread);
  void endIfFailed();

  // How it ends before the application does; none returns.
  [[noreturn]] void endWithBadTrace();
  [[noreturn]] void endMonkey(const std::string& why);
  [[noreturn]] void endWithFailure(const TraceFailure& failure);
  std::string keepFailure();

  const SessionSettings settings;
  Size screenSize = {};
  float density = 0;    // dots per inch
  std::string problem;  // of the environment, for who opens the screen
  ParsedTrace parsed;
  std::optional<TurnClock> turns;

  // Held while the session works, and never while a call of the clock may wait. Guards all below.
  std::mutex mutex;
  std::optional<SessionReport> report;
  std::optional<TraceRecorder> recorder;
  std::optional<TraceRunner> runner;
  std::optional<Monkey> monkey;
  std::optional<uint64_t> closedBy;  // when the application is to have ended, after a monkey
  MemoryWatch memory;                // while the monkey plays
  uint64_t nextLook = 0;             // at it: so many records have come then
  uint64_t nextTold = 0;             // of the monkey: records,
  uint64_t nextToldMs = 0;           // and time
  World world;
  Platform* open = nullptr;
  Frame lastFrame;
  int frames = 0;
  TraceLine present;  // the trace's step that runs
  bool hasPosted = false;

  std::mutex arrivalMutex;  // guards arrivals; the display's thread may not wait for the session
  std::vector<Arrival> arrivals;
  DisplayChoice display = DisplayChoice::Headless;
  std::atomic<bool> closeAsked = false;
  std::atomic<bool> isOver = false;
};

/// Null where the environment asks for none. The first call decides.
Session* session();

}  // namespace brimol::pc
