// What the toolkit adds to the platform's own calls: the passes over the layers, registering, and
// long texts.
#include <MW/button.h>
#include <MW/dialog.h>
#include <MW/main_list.h>
#include <MW/static_text.h>
#include <MW/window.h>
#include <android/log.h>
#include <benchmark/benchmark.h>
#include <brimol/frame.h>
#include <brimol/input.h>

#include <algorithm>
#include <chrono>
#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include "percentile.h"

namespace {

using MW::Button;
using MW::Window;

constexpr int kCallsPerSample = 2000;  // between two looks at the clock
constexpr unsigned int kTicks = 1000;

struct Face {
  SKIA_Rect rect = {100, 200, 600, 240, 0xFFB8C4D6};
  SKIA_Text text = {};

  Face() {
    std::strcpy(text.text, "A button");
    text.string_len = static_cast<int32_t>(std::strlen(text.text));
    text.size = 48;
  }
};

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

template <typename Work>
double nanoseconds(int times, Work work) {
  const auto start = std::chrono::steady_clock::now();
  for (int i = 0; i < times; ++i) work();
  return std::chrono::duration<double, std::nano>(std::chrono::steady_clock::now() - start).count();
}

// Runs `pass` and `bare` in turn, so that both meet the same machine, and reports the median of
// each, in nanoseconds a call, and of their ratio.
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
}

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

// What a drawing pass of one widget calls.
struct Calls {
  SKIA_ItemKind kind;
  int count;
};

void addItem(const SKIA_Item& item) {
  switch (item.kind) {
    case SKIA_LABEL: skia_add_label_c(item.rect, item.text); break;
    case SKIA_TEXTBOX: skia_add_textbox_c(item.rect, item.text); break;
    case SKIA_ROUNDTEXTBOX: skia_add_roundtextbox_c(item.rect, item.text); break;
    case SKIA_ROUNDBOX: skia_add_roundbox_c(item.rect); break;
    case SKIA_LINE: skia_add_line_c(item.point); break;
    default: skia_add_box_c(item.rect); break;
  }
}

// The drawing pass over one widget against the calls that it makes, made by hand.
void compareWidget(benchmark::State& state, MW::Widget& widget, const std::vector<Calls>& calls) {
  std::vector<SKIA_Item> items;
  for (const Calls& each : calls) {
    items.insert(items.end(), static_cast<std::size_t>(each.count), {each.kind, {}, {}, {}});
  }
  widget.setActive(1);
  const auto pass = [] {
    skia_begin_frame_c();
    Window::show(kTicks);
  };
  const auto bare = [&items] {
    skia_begin_frame_c();
    for (const SKIA_Item& item : items) addItem(item);
  };
  compare(state, static_cast<int>(items.size()), pass, bare);
}

// A main menu of 64 rows. The first one begins where the list does and is not drawn.
void mainListPass(benchmark::State& state) {
  constexpr int kRowHeight = 20;  // pixels: all of them are in view
  MW::MainList list("A menu", 1);
  const Face face;
  for (int i = 0; i < MW::MainList::kItems; ++i) {
    list.addIndex(MW::MainList::kSelectable, &face.text, kRowHeight);
  }
  list.initFinish();
  compareWidget(state, list,
                {{SKIA_TEXTBOX, MW::MainList::kItems - 1}, {SKIA_BOX, 2}, {SKIA_LABEL, 9}});
}

// A dialog of two buttons.
void dialogPass(benchmark::State& state) {
  MW::Dialog dialog(0);
  compareWidget(
      state, dialog,
      {{SKIA_BOX, 4}, {SKIA_LINE, 1}, {SKIA_LABEL, 2}, {SKIA_ROUNDBOX, 2}, {SKIA_ROUNDTEXTBOX, 2}});
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

// A whole screen of a log, with line numbers and all.
struct LogView : MW::StaticText {
  static constexpr SKIA_Rect kArea = {0, 0, 1440, 2560, 0};
  static constexpr SKIA_Text kLooks = {{}, 0, 0, SKIA_ALIGN_LEFT, 40};
  LogView() : StaticText(&kArea, &kLooks, true, true, true) {}
  void showEnd() { top_index = last_index - h_count; }
};

// So many lines of so many bytes, which run through the alphabet.
std::string textOf(const benchmark::State& state) {
  constexpr int64_t kLetters = 26;
  std::string line;
  for (int64_t i = 1; i < state.range(1); ++i) line += static_cast<char>('a' + i % kLetters);
  std::string text;
  for (int64_t i = 0; i < state.range(0); ++i) text += line + '\n';
  return text;
}

void countBytes(benchmark::State& state, const std::string& text) {
  state.SetBytesProcessed(state.iterations() * static_cast<int64_t>(text.size()));
}

void settingText(benchmark::State& state) {
  const std::string text = textOf(state);
  LogView view;
  for ([[maybe_unused]] auto round : state) view.setText(text.c_str());
  countBytes(state, text);
}

void searchingText(benchmark::State& state, const char* wanted) {
  const std::string text = textOf(state);
  LogView view;
  view.setText(text.c_str());
  view.get_ime_result(wanted);
  for ([[maybe_unused]] auto round : state) view.line_search(text.c_str());
  countBytes(state, text);
}

// The end of the text.
void drawingText(benchmark::State& state) {
  LogView view;
  view.setText(textOf(state).c_str());
  view.showEnd();
  for ([[maybe_unused]] auto round : state) {
    skia_begin_frame_c();
    view.show();
  }
}

BENCHMARK(drawingPass)->RangeMultiplier(10)->Range(1, 1000)->Unit(benchmark::kMicrosecond);
BENCHMARK(timerPass)->RangeMultiplier(10)->Range(1, 1000)->Unit(benchmark::kMicrosecond);
BENCHMARK(mainListPass)->Unit(benchmark::kMicrosecond);
BENCHMARK(dialogPass)->Unit(benchmark::kMicrosecond);
BENCHMARK(registering)->Arg(0)->Arg(10)->Arg(100)->Arg(1000);
BENCHMARK(settingText)->Args({156'250, 64})->Args({1, 10'000'000})->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(searchingText, inNoLine, "xz")
    ->Args({156'250, 64})
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(searchingText, inAll, "xy")->Args({156'250, 64})->Unit(benchmark::kMillisecond);
BENCHMARK(drawingText)->Args({100, 64})->Args({1'000'000, 64})->Unit(benchmark::kMicrosecond);

}  // namespace

int main(int count, char** arguments) {
  __android_log_set_minimum_priority(ANDROID_LOG_SILENT);
  benchmark::Initialize(&count, arguments);
  if (benchmark::ReportUnrecognizedArguments(count, arguments)) return EXIT_FAILURE;
  benchmark::RunSpecifiedBenchmarks();
  benchmark::Shutdown();
  return EXIT_SUCCESS;
}
