/// A platform for tests: it draws nothing and remembers everything, its clock stands still until it
/// is set, and its input is what a test feeds.
#pragma once

#include <brimol/input.h>

#include <array>
#include <atomic>
#include <condition_variable>
#include <cstddef>
#include <deque>
#include <map>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

#include "support/records.h"

namespace brimol::test {

/// What a Delay does on a thread that is not the test's.
enum class Pauses {
  Short,  ///< returns after a moment
  Parked  ///< waits until the threads are released
};

/// The one platform. Any thread may call it.
class RecordingPlatform {
 public:
  /// As new: nothing recorded, time 0, display live, density unknown. No other thread may run.
  /// The calling thread is from here on the test's.
  void reset();

  /// What happened since the reset or the last take, oldest first. Taking forgets it.
  std::vector<Drawing> takeDrawings();
  std::vector<LogLine> takeLog();
  std::vector<unsigned int> takeDelays();  ///< milliseconds, of the test's thread only

  /// With false, drawings and log lines are dropped: for tests that make many.
  std::atomic<bool> records = true;

  std::atomic<unsigned int> ticks = 0;  ///< what GetTicks() returns
  std::atomic<int> live = 1;            ///< what skia_live_widget_c() returns
  std::atomic<int> liveAsked = 0;       ///< how often it was asked
  std::atomic<int> nextHandle = 0;      ///< what the next drawing call returns
  std::atomic<float> xdpi = 0, ydpi = 0;
  std::atomic<int> inits = 0, quits = 0;  ///< of the input service
  std::atomic<unsigned int> initFlags = 0;

  /// PollEvent returns it after those that were fed before.
  void feed(const Event& event);
  /// From now on PollEvent also returns these over and over, each one after another thread paused:
  /// input never runs ahead of the one that takes it.
  void feedOverAndOver(std::vector<Event> events);

  /// Decides what threads other than the test's do in Delay. `Short` releases those that wait.
  void setPauses(Pauses wanted);
  /// Waits until so many threads are parked.
  void awaitParked(int threads);

  // The platform's side.
  int draw(const Drawing& drawing);
  void log(int priority, const char* tag, const char* message);
  int poll(Event& event);
  void delay(unsigned int ms);
  std::map<std::string, std::string> properties;  // the test's thread only

 private:
  // Kept without allocating, so that a line about missing memory can be kept too.
  struct KeptLine {
    int priority;
    std::array<char, 32> tag;
    std::array<char, 320> message;
  };

  void park(std::unique_lock<std::mutex>& guard);

  std::mutex lock;  // guards all below
  std::condition_variable changed;
  std::vector<Drawing> drawings;
  std::array<KeptLine, 512> lines;
  std::size_t lineCount = 0;
  std::vector<unsigned int> delays;
  std::deque<Event> fed;
  std::vector<Event> cycle;
  std::size_t cycleNext = 0;
  int cycleDue = 0;
  std::thread::id testThread;
  std::thread::id pollingThread;
  Pauses pauses = Pauses::Short;
  int parked = 0;
};

RecordingPlatform& platform();

}  // namespace brimol::test
