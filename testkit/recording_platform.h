/// A platform for tests: it draws nothing and remembers everything, its clock stands still until it
/// is set, and its input is what a test feeds.
#pragma once

#include <brimol/input.h>

#include <atomic>
#include <deque>
#include <map>
#include <mutex>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "testkit/records.h"

namespace brimol::test {

/// What a test sets and reads while no other thread runs or all of them are parked.
struct PlatformState {
  bool records = true;       ///< false: drawings and log lines are dropped
  int live = 1;              ///< what skia_live_widget_c() returns
  int liveAsked = 0;         ///< how often it was asked
  int nextHandle = 0;        ///< what drawing calls return
  float xdpi = 0, ydpi = 0;  ///< 0: unknown
  int inits = 0, quits = 0;  ///< of the input service
  unsigned int initFlags = 0;
  unsigned int paused = 0;  ///< milliseconds that the test's thread spent in Delay
  std::vector<Drawing> drawings;
  std::vector<LogLine> lines;
  std::deque<Event> fed;
  std::map<std::string, std::string> properties;
};

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

  std::atomic<unsigned int> ticks = 0;  ///< what GetTicks() returns

  /// Whether threads other than the test's stay in Delay, and how many are there.
  std::atomic<bool> parks = false;
  std::atomic<int> parked = 0;

  std::thread::id testThread;
  std::mutex lock;  // guards `records`, the lists and the properties

 private:
  template <typename List>
  List take(List& list) {
    const std::lock_guard guard(lock);
    return std::exchange(list, {});
  }
};

RecordingPlatform& platform();

}  // namespace brimol::test
