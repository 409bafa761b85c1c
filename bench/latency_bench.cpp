// How long an event takes from its arrival at the platform to the application's callback, on the
// real threads: the platform's queue, the input thread, the dispatch thread.
#include <MW/button.h>
#include <MW/event_service.h>
#include <MW/window.h>
#include <android/log.h>
#include <benchmark/benchmark.h>

#include <algorithm>
#include <atomic>
#include <chrono>
#include <cstdlib>
#include <vector>

#include "input/input_service.h"
#include "percentile.h"

namespace {

using Clock = std::chrono::steady_clock;

std::atomic<Clock::rep> called = 0;  // when the callback ran; 0: not yet

double millisecondsTo(Clock::rep time, Clock::time_point start) {
  const Clock::duration taken = Clock::duration(time) - start.time_since_epoch();
  return std::chrono::duration<double, std::milli>(taken).count();
}

double waitForCallback(Clock::time_point start) {
  called.wait(0);
  return millisecondsTo(called.exchange(0), start);
}

void pressToCallback(benchmark::State& state) {
  constexpr SKIA_Rect kArea = {0, 0, 100, 100, 0};
  constexpr double kAlmostAll = 0.99;
  MW::Window::init();
  {
    MW::Button button(&kArea, nullptr);
    button.pressCallback = [](int) {
      called = Clock::now().time_since_epoch().count();
      called.notify_one();
    };
    button.setActive(1);
    Event press = {};
    press.pointer.type = BRIMOL_POINTER_DOWN;
    std::vector<double> milliseconds;
    for ([[maybe_unused]] auto round : state) {
      const auto start = Clock::now();
      brimol::pc::inputService().post(press);
      milliseconds.push_back(waitForCallback(start));
    }
    state.counters["median_ms"] = median(milliseconds);
    state.counters["p99_ms"] = percentile(milliseconds, kAlmostAll);
    state.counters["worst_ms"] = percentile(milliseconds, 1);
  }
  MW::Window::destroy();
}

BENCHMARK(pressToCallback)->Iterations(5000)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace

int main(int count, char** arguments) {
  setenv("BRIMOL_DISPLAY", "headless", 1);
  __android_log_set_minimum_priority(ANDROID_LOG_SILENT);
  benchmark::Initialize(&count, arguments);
  if (benchmark::ReportUnrecognizedArguments(count, arguments)) return EXIT_FAILURE;
  benchmark::RunSpecifiedBenchmarks();
  benchmark::Shutdown();
  return EXIT_SUCCESS;
}
