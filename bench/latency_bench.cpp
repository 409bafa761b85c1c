// How long an event takes from its arrival at the platform to the application's callback and to the
// painted frame, on the real threads of an application; how late it comes behind a flood; and what
// an application costs in which nothing happens, or which draws the same again.
#include <MW/button.h>
#include <MW/event_service.h>
#include <MW/window.h>
#include <android/log.h>
#include <benchmark/benchmark.h>
#include <brimol/frame.h>
#include <brimol/host.h>
#include <sys/resource.h>

#include <atomic>
#include <chrono>
#include <cstdlib>
#include <optional>
#include <random>
#include <thread>
#include <vector>

#include "allocations.h"
#include "host/open_platform.h"
#include "input/event_records.h"
#include "input/input_service.h"
#include "percentile.h"

namespace {

using brimol::pc::inputService;
using brimol::pc::pointerRecord;
using Clock = std::chrono::steady_clock;

constexpr unsigned int kLoopMs = 5;  // as the example application's
constexpr double kAlmostAll = 0.99;

// When something happened for the first time since it was last asked for.
class Mark {
 public:
  void set() {
    Clock::rep none = 0;
    if (time.compare_exchange_strong(none, Clock::now().time_since_epoch().count())) {
      time.notify_one();
    }
  }
  Clock::time_point await() {
    time.wait(0);
    return Clock::time_point(Clock::duration(time.exchange(0)));
  }

 private:
  std::atomic<Clock::rep> time = 0;
};

Mark gCalled;
Mark gPainted;
std::atomic<bool> gWantsFrame = false;
std::atomic<int> gFrames = 0;

// An application with one button and the usual loop, which draws and tells when it was painted.
class Application {
 public:
  Application() {
    brimol_host_open();
    brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
    MW::Window::init();
    button.emplace(&kArea, nullptr);
    button->pressCallback = [](int) { gCalled.set(); };
    button->setActive(1);
    loop = std::jthread([](const std::stop_token& stop) {
      while (!stop.stop_requested()) round();
    });
  }
  ~Application() {
    loop = {};
    button.reset();
    MW::Window::destroy();
  }
  Application(const Application&) = delete;
  Application& operator=(const Application&) = delete;

  static constexpr SKIA_Rect kArea = {0, 0, 100, 100, 0};

 private:
  static void round() {
    if (MW::isDisplayUpdate(0) == 1) {
      skia_begin_frame_c();
      MW::Window::show();
      skia_end_frame_c();
      ++gFrames;
      if (gWantsFrame.exchange(false)) {
        brimol::pc::openedPlatform()->copyPicture(std::chrono::seconds(1));
        gPainted.set();
      }
    }
    MW::Window::updateTimer(0);  // older commits, too, are measured by this
    Delay(kLoopMs);
  }

  std::optional<MW::Button> button;
  std::jthread loop;
};

double millisecondsBetween(Clock::time_point start, Clock::time_point end) {
  return std::chrono::duration<double, std::milli>(end - start).count();
}

void report(benchmark::State& state, std::vector<double>& values) {
  state.counters["median_ms"] = median(values);
  state.counters["p99_ms"] = percentile(values, kAlmostAll);
  state.counters["worst_ms"] = percentile(values, 1);
}

// Presses and releases that come at random moments, as a finger's do.
void measurePresses(benchmark::State& state, Mark& seen) {
  const Application application;
  std::minstd_rand random;
  std::uniform_int_distribution<int> pauses(10'000, 30'000);  // microseconds
  std::vector<double> times;
  for ([[maybe_unused]] auto round : state) {
    std::this_thread::sleep_for(std::chrono::microseconds(pauses(random)));
    gWantsFrame = &seen == &gPainted;
    const auto start = Clock::now();
    inputService().post(pointerRecord(BRIMOL_POINTER_DOWN, 0, {1, 1}));
    times.push_back(millisecondsBetween(start, seen.await()));
    if (&seen != &gCalled) gCalled.await();
    inputService().post(pointerRecord(BRIMOL_POINTER_UP, 0, {1, 1}));
  }
  report(state, times);
}

void pressToCallback(benchmark::State& state) { measurePresses(state, gCalled); }
void pressToFrame(benchmark::State& state) { measurePresses(state, gPainted); }

// Ten fingers that move 120 times a second for five seconds.
void moveTenFingers() {
  auto next = Clock::now();
  for (int step = 0; step < 600; ++step) {
    for (int finger = 1; finger <= 10; ++finger) {
      inputService().post(pointerRecord(BRIMOL_POINTER_MOTION, finger, {200 + step, 300}));
    }
    std::this_thread::sleep_until(next += std::chrono::microseconds(8333));
  }
}

void pressBehindTenFingers(benchmark::State& state) {
  const Application application;
  std::vector<double> times;
  for ([[maybe_unused]] auto round : state) {
    moveTenFingers();
    const auto start = Clock::now();
    inputService().post(pointerRecord(BRIMOL_POINTER_DOWN, 0, {1, 1}));
    times.push_back(millisecondsBetween(start, gCalled.await()));
    inputService().post(pointerRecord(BRIMOL_POINTER_UP, 0, {1, 1}));
  }
  report(state, times);
}

constexpr std::chrono::seconds kIdleTime{5};

struct Usage {
  double seconds;  // of a processor
  double wakeups;
};

template <typename Work>
Usage usageOf(const Work& work) {
  const auto now = [] {
    rusage used = {};
    ::getrusage(RUSAGE_SELF, &used);
    const auto seconds = [](const timeval& time) {
      constexpr double kMicro = 1e-6;
      return static_cast<double>(time.tv_sec) + kMicro * static_cast<double>(time.tv_usec);
    };
    return Usage{seconds(used.ru_utime) + seconds(used.ru_stime),
                 static_cast<double>(used.ru_nvcsw)};
  };
  const Usage before = now();
  work();
  const Usage after = now();
  return {after.seconds - before.seconds, after.wakeups - before.wakeups};
}

// Beside it, what as many wakeups cost that do nothing.
void idle(benchmark::State& state) {
  const Usage bare = usageOf([] {
    for (int i = 0; i < 500; ++i) std::this_thread::sleep_for(std::chrono::milliseconds(4));
  });
  const Application application;
  std::this_thread::sleep_for(std::chrono::seconds(2));
  for ([[maybe_unused]] auto round : state) {
    const Usage used = usageOf([] { std::this_thread::sleep_for(kIdleTime); });
    constexpr double kPercent = 100;
    state.counters["core_percent"] = kPercent * used.seconds / kIdleTime.count();
    state.counters["wakeups_per_s"] = used.wakeups / kIdleTime.count();
    state.counters["bare_percent"] =
        kPercent * used.wakeups * bare.seconds / bare.wakeups / kIdleTime.count();
  }
}

// What all threads together ask for, from the drawing to the picture.
void sameFrame(benchmark::State& state) {
  const Application application;
  std::this_thread::sleep_for(std::chrono::milliseconds(100));
  for ([[maybe_unused]] auto round : state) {
    const uint64_t before = allocationCount();
    const int frames = gFrames;
    for (int wanted = 0; wanted < 100; ++wanted) {
      MW::isDisplayUpdate(1);
      std::this_thread::sleep_for(std::chrono::milliseconds(2 * kLoopMs));
    }
    state.counters["allocations"] =
        static_cast<double>(allocationCount() - before) / (gFrames - frames);
  }
}

BENCHMARK(pressToCallback)->Iterations(500)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(pressToFrame)->Iterations(500)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(pressBehindTenFingers)->Iterations(3)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(sameFrame)->Iterations(1)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(idle)->Iterations(1)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace

int main(int count, char** arguments) {
  setenv("BRIMOL_DISPLAY", "headless", 1);
  setenv("BRIMOL_SCREEN", "480x800", 1);
  __android_log_set_minimum_priority(ANDROID_LOG_SILENT);
  benchmark::Initialize(&count, arguments);
  if (benchmark::ReportUnrecognizedArguments(count, arguments)) return EXIT_FAILURE;
  benchmark::RunSpecifiedBenchmarks();
  benchmark::Shutdown();
  return EXIT_SUCCESS;
}
