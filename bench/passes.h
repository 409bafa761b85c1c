/// Passes and the same calls made by hand, measured by turns.
#pragma once

#include <benchmark/benchmark.h>
#include <brimol/scene.h>

#include <algorithm>
#include <chrono>
#include <cstring>
#include <vector>

#include "percentile.h"

inline constexpr int kCallsPerSample = 2000;  // between two looks at the clock
inline constexpr unsigned int kTicks = 1000;  // milliseconds

/// What the buttons and rows look like.
struct Face {
  SKIA_Rect rect = {100, 200, 600, 240, 0xFFB8C4D6};
  SKIA_Text text = {};

  Face() {
    std::strcpy(text.text, "A button");
    text.string_len = static_cast<int32_t>(std::strlen(text.text));
    text.size = 48;
  }
};

template <typename Work>
double nanoseconds(int times, Work work) {
  const auto start = std::chrono::steady_clock::now();
  for (int i = 0; i < times; ++i) work();
  return std::chrono::duration<double, std::nano>(std::chrono::steady_clock::now() - start).count();
}

/// Runs `pass` and `bare` in turn, so that both meet the same machine, and reports the median of
/// each, in nanoseconds a call, of their ratio, and how many microseconds of a frame the pass
/// takes.
template <typename Pass, typename Bare>
void compare(benchmark::State& state, int calls, Pass pass, Bare bare) {
  const int times = std::max(1, kCallsPerSample / std::max(1, calls));
  std::vector<double> passes;
  std::vector<double> bares;
  std::vector<double> ratios;
  for ([[maybe_unused]] auto round : state) {
    passes.push_back(nanoseconds(times, pass) / times / calls);
    bares.push_back(nanoseconds(times, bare) / times / calls);
    ratios.push_back(passes.back() / bares.back());
  }
  state.counters["pass_ns"] = median(passes);
  state.counters["bare_ns"] = median(bares);
  state.counters["ratio"] = median(ratios);
  constexpr double kNanosInMicro = 1000;
  state.counters["frame_us"] = state.counters["pass_ns"] * calls / kNanosInMicro;
}
