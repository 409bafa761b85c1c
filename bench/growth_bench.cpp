// What much of something needs: the memory of ten thousand widgets, and a text of 100 MB.
#include <MW/button.h>
#include <MW/static_text.h>
#include <benchmark/benchmark.h>
#include <brimol/frame.h>
#include <malloc.h>

#include <memory>
#include <string>
#include <vector>

#include "passes.h"
#include "resident.h"

namespace {

constexpr double kKilobyte = 1024;

// Memory that was used before and is free would hide what is added.
double residentNow() {
  ::malloc_trim(0);
  return static_cast<double>(residentKb());
}

void memoryOfButtons(benchmark::State& state) {
  const auto count = static_cast<std::size_t>(state.range(0));
  const Face face;
  for ([[maybe_unused]] auto round : state) {
    const double before = residentNow();
    std::vector<std::unique_ptr<MW::Button>> buttons;
    for (std::size_t i = 0; i < count; ++i) {
      buttons.push_back(std::make_unique<MW::Button>(&face.rect, &face.text));
    }
    state.counters["bytes_each"] =
        (residentNow() - before) * kKilobyte / static_cast<double>(count);
  }
}

// Lines of 64 bytes: taking the text over, and drawing what is in view of it.
void hugeText(benchmark::State& state) {
  constexpr std::size_t kMegabyte = 1'000'000;
  constexpr std::size_t kMegabytes = 100;
  constexpr SKIA_Rect kScreen = {0, 0, 1440, 2560, 0xFFE0E0E0};
  std::string line = "12:00:00 sensor 12345 reads 0.5, as it should be";
  line.resize(63, '.');
  std::string text;
  text.reserve(kMegabytes * kMegabyte);
  while (text.size() < kMegabytes * kMegabyte) (text += line) += '\n';
  SKIA_Text looks = {};
  looks.size = 40;
  for ([[maybe_unused]] auto round : state) {
    MW::StaticText viewer(&kScreen, &looks, true, true, true);
    const double before = residentNow();
    constexpr double kNanosInMilli = 1e6;
    state.counters["set_ms"] =
        nanoseconds(1, [&] { viewer.setText(text.c_str()); }) / kNanosInMilli;
    state.counters["memory_mb"] = (residentNow() - before) * kKilobyte / kMegabyte;
    constexpr int kTimes = 100;
    constexpr double kNanosInMicro = 1e3;
    state.counters["draw_us"] = nanoseconds(kTimes,
                                            [&viewer] {
                                              skia_begin_frame_c();
                                              viewer.show(kTicks);
                                            }) /
                                kTimes / kNanosInMicro;
  }
}

BENCHMARK(memoryOfButtons)->Arg(1000)->Arg(10'000)->Iterations(1);
BENCHMARK(hugeText)->Iterations(1);

}  // namespace
