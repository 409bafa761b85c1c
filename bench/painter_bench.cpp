// What painting costs, for each scene. Each painting is followed by a memset of a frame; frames for
// that take turns, so that none stays in the processor's cache. Least and median: microseconds, and
// how many of the memsets' least and median that is.

#include <benchmark/benchmark.h>

#include <algorithm>
#include <chrono>
#include <cstring>
#include <deque>
#include <vector>

#include "allocations.h"
#include "painter/painter.h"
#include "percentile.h"
#include "scenes.h"

namespace {

using brimol::pc::Painter;
using Clock = std::chrono::steady_clock;
using Microseconds = std::chrono::duration<double, std::micro>;

constexpr std::size_t kFrameBytes = std::size_t{4} * scenes::kScreen.w * scenes::kScreen.h;

template <typename Work>
double microsecondsOf(const Work& work) {
  const auto start = Clock::now();
  work();
  return Microseconds(Clock::now() - start).count();
}

// The pictures of idle painters, in pages like those that are measured; more than caches hold.
class Buffers {
 public:
  Buffers() {
    while (painters.size() < kCount) painters.emplace_back(scenes::kScreen);
  }

  double setNext() {
    auto* const bytes = cairo_image_surface_get_data(painters.at(next % kCount).picture());
    ++next;
    return microsecondsOf([bytes, value = static_cast<int>(next % 2)] {
      std::memset(bytes, value, kFrameBytes);
      benchmark::DoNotOptimize(bytes);
      benchmark::ClobberMemory();
    });
  }

 private:
  static constexpr std::size_t kCount = 6;
  std::deque<Painter> painters;
  std::size_t next = 0;
};

void report(benchmark::State& state, std::vector<double>& paintings, std::vector<double>& memsets) {
  const double least = percentile(paintings, 0);
  const double middle = median(paintings);
  state.counters["least_us"] = least;
  state.counters["median_us"] = middle;
  state.counters["least_memsets"] = least / percentile(memsets, 0);
  state.counters["median_memsets"] = middle / median(memsets);
}

// The first frames fill the painter's caches and are not measured.
void painting(benchmark::State& state, scenes::Frame (*frameOf)(int number)) {
  constexpr int kWarmUp = 20;
  Painter painter(scenes::kScreen);
  Buffers buffers;
  int number = 0;
  while (number < kWarmUp) painter.paint(frameOf(number++));
  std::vector<double> paintings;
  std::vector<double> memsets;
  uint64_t allocations = 0;
  while (state.KeepRunning()) {
    const brimol::pc::Frame frame = frameOf(number++);
    const uint64_t before = allocationCount();
    const double taken = microsecondsOf([&painter, &frame] { painter.paint(frame); });
    allocations += allocationCount() - before;
    paintings.push_back(taken);
    memsets.push_back(buffers.setNext());
    state.SetIterationTime(taken / Microseconds::period::den);
  }
  state.counters["allocations"] =
      static_cast<double>(allocations) / static_cast<double>(paintings.size());
  report(state, paintings, memsets);
}

constexpr int kFrames = 200;
BENCHMARK_CAPTURE(painting, fill, scenes::fill)->UseManualTime()->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, menu, scenes::menu)->UseManualTime()->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, menu_with_new_texts, scenes::menuWithNewTexts)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, one_new_row_text, scenes::menuWithOneNewText)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, menu_scrolled_by_12, scenes::menuScrolled)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, press, scenes::menuWithPress)->UseManualTime()->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, menu_under_veil, scenes::menuUnderVeil)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, list_of_64_rows, scenes::list)->UseManualTime()->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, list_scrolled_by_10, scenes::listScrolled)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, keyboard_of_42_keys, scenes::keyboard)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, veil_and_dialog, scenes::veilWithDialog)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, log_of_60x80, scenes::log)->UseManualTime()->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, log_moved_by_a_line, scenes::logMovedByALine)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, log_of_60_new_lines, scenes::logWithNewLines)
    ->UseManualTime()
    ->Iterations(kFrames);
BENCHMARK_CAPTURE(painting, nothing_changed, scenes::nothingChanged)
    ->UseManualTime()
    ->Iterations(kFrames);

}  // namespace

BENCHMARK_MAIN();
