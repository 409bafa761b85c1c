// What the toolkit adds to the platform's own calls and to the timer's, the more widgets there are;
// and registering.
#include <MW/button.h>
#include <MW/window.h>
#include <android/log.h>
#include <benchmark/benchmark.h>
#include <brimol/frame.h>
#include <brimol/input.h>

#include <atomic>
#include <memory>
#include <thread>
#include <vector>

#include "passes.h"

namespace {

using MW::Button;
using MW::Window;

class ActiveButtons {
 public:
  explicit ActiveButtons(std::size_t count) {
    const Face face;
    for (std::size_t i = 0; i < count; ++i) {
      buttons.push_back(std::make_unique<Button>(&face.rect, &face.text));
      buttons.back()->setActive(1);
    }
  }

 private:
  std::vector<std::unique_ptr<Button>> buttons;
};

// Against the same drawing calls made by hand.
void drawingPass(benchmark::State& state) {
  const auto widgets = static_cast<std::size_t>(state.range(0));
  const ActiveButtons buttons(widgets);
  const std::vector<Face> faces(widgets);
  const auto pass = [] {
    skia_begin_frame_c();
    Window::show(kTicks);
  };
  const auto bare = [&faces] {
    skia_begin_frame_c();
    for (const Face& face : faces) skia_add_buttonbox_c(face.rect, face.text);
  };
  compare(state, static_cast<int>(widgets), pass, bare);
}

// Against reading the clock and making the same virtual calls by hand.
void timerPass(benchmark::State& state) {
  const auto widgets = static_cast<std::size_t>(state.range(0));
  const ActiveButtons buttons(widgets);
  const Face face;
  std::vector<std::unique_ptr<MW::Widget>> others;
  for (std::size_t i = 0; i < widgets; ++i) {
    others.push_back(std::make_unique<Button>(&face.rect, &face.text));
    Window::unregisterWidget(others.back().get());
  }
  const auto pass = [] { Window::updateTimer(0); };
  const auto bare = [&others] {
    const unsigned int now = GetTicks();
    for (const auto& widget : others) widget->updateTimer(now);
  };
  compare(state, static_cast<int>(widgets), pass, bare);
}

// One more button beside those that the argument counts.
void registering(benchmark::State& state) {
  const ActiveButtons buttons(static_cast<std::size_t>(state.range(0)));
  const Face face;
  Button button(&face.rect, &face.text);
  for ([[maybe_unused]] auto round : state) {
    Window::unregisterWidget(&button);
    Window::registerWidget(&button);
  }
}

constexpr int kMost = 10'000;
BENCHMARK(drawingPass)->Name("drawing/buttons")->RangeMultiplier(10)->Range(1, kMost);
BENCHMARK(timerPass)->Name("timer/buttons")->RangeMultiplier(10)->Range(1, kMost);
BENCHMARK(registering)->RangeMultiplier(10)->Range(1, kMost);

}  // namespace

// Beside a thread that waits, as an application's do: in a process with one thread the C library's
// locks cost nothing.
int main(int count, char** arguments) {
  __android_log_set_minimum_priority(ANDROID_LOG_SILENT);
  benchmark::Initialize(&count, arguments);
  if (benchmark::ReportUnrecognizedArguments(count, arguments)) return EXIT_FAILURE;
  std::atomic<bool> isOver = false;
  const std::jthread other([&isOver] { isOver.wait(false); });
  benchmark::RunSpecifiedBenchmarks();
  isOver = true;
  isOver.notify_one();
  benchmark::Shutdown();
  return EXIT_SUCCESS;
}
