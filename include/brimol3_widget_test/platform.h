/// A platform for tests: it draws nothing and remembers everything, its clock stands still until it
/// is set, and its input is what a test feeds.
#pragma once

#include <brimol/input.h>
#include <brimol3_widget_test/records.h>
#include <brimol3_widget_test/turns.h>

#include <atomic>
#include <deque>
#include <map>
#include <mutex>
#include <string>
#include <thread>
#include <utility>
#include <vector>

namespace brimol::test {

/// What a test sets and reads while no other thread runs or all of them are held.
struct PlatformState {
  bool records = true;         ///< false: drawings and log lines are dropped
  int live = 1;                ///< what skia_live_widget_c() returns
  int liveAsked = 0;           ///< how often it was asked
  int nextHandle = 0;          ///< what drawing calls return
  bool hasProperties = true;   ///< false: calls of properties fail, and leave alone what is given
  int failingCall = 0;         ///< which drawing or property call fails; 1: the next, 0: none
  float xdpi = 0;              ///< dots per inch, 0: unknown
  float ydpi = 0;              ///< the same
  int inits = 0;               ///< of the input service
  int quits = 0;               ///< the same
  unsigned int initFlags = 0;  ///< of the last EventInit
  unsigned int paused = 0;     ///< milliseconds that the test's thread spent in Delay
  std::vector<Drawing> drawings;                  ///< calls that nobody has taken
  std::vector<LogLine> lines;                     ///< the same of the log
  std::deque<Event> fed;                          ///< what PollEvent has not returned yet
  std::map<std::string, std::string> properties;  ///< the system properties

  // What brimol/host.h tells of.
  int width = 1440, height = 2560;  ///< of the screen, pixels
  bool closeRequested = false;      ///< the user has asked to close the window
  int brightness = 100;             ///< per cent, as last set
  int64_t utcMs = kDefaultUtcMs;    ///< since 1970, when the clock stood at clockBase()
  uint32_t random = 1;              ///< the next random number; the one behind it is one more
  std::map<std::string, std::string> figures;  ///< by name; a figure that is not here is empty

  static constexpr int64_t kDefaultUtcMs = 1'767'225'600'000;  ///< 2026-01-01T00:00:00Z
};

/// Where the clocks of all tests begin, in milliseconds: what BRIMOL_TEST_CLOCK says, 0 to 2^32 -
/// 1, or 0. With 4294962296, five seconds before the clock's end, tests show what a program does
/// when the clock starts over. Throws Failure for anything else.
unsigned int clockBase();

/// The one platform. The platform's calls may come from any thread, and so may these.
struct RecordingPlatform : PlatformState {
  /// As new. The calling thread is from here on the test's.
  void reset();

  /// What happened since the reset or the last take, oldest first. Taking forgets it.
  std::vector<Drawing> takeDrawings() { return take(drawings); }
  std::vector<LogLine> takeLog() { return take(lines); }

  /// PollEvent returns it after those that were fed before.
  void feed(const Event& event) {
    const std::lock_guard guard(lock);
    fed.push_back(event);
  }

  std::atomic<unsigned int> ticks = 0;  ///< what GetTicks() returns, in milliseconds
  Turns turns;                          ///< of the other threads, in Delay

  std::thread::id testThread;  ///< the one that called reset()
  std::mutex lock;             ///< guards `records`, the lists and the properties

 private:
  template <typename List>
  List take(List& list) {
    const std::lock_guard guard(lock);
    return std::exchange(list, {});
  }
};

/// The platform, from the process's start to its end.
RecordingPlatform& platform();

}  // namespace brimol::test
