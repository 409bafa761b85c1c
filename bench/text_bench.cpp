// What the text viewer costs with texts of any length.
#include <MW/static_text.h>
#include <benchmark/benchmark.h>
#include <brimol/frame.h>

#include <string>

#include "passes.h"

namespace {

constexpr SKIA_Rect kScreen = {0, 0, 1440, 2560, 0xFFE0E0E0};
constexpr std::size_t kTextBytes = 10'000'000;
constexpr const char* kNeedle = "needle";

class Viewer : public MW::StaticText {
 public:
  Viewer() : StaticText(&kScreen, &kLooks, true, true, true) {}
  void search(const std::string& source, const char* wanted) {
    get_ime_result(wanted);
    line_search(source.c_str());
  }

 private:
  static constexpr SKIA_Text kLooks = {
      .text = {}, .string_len = 0, .color = 0, .align = 1, .size = 40};
};

// The needle stands once, in a line of its own behind so many others.
std::string linesAround(std::size_t before, std::size_t behind) {
  constexpr const char* kLine = "12:00:00 sensor 12345 reads 0.5, as it should be\n";
  std::string text;
  for (std::size_t i = 0; i < before; ++i) text += kLine;
  (text += kNeedle) += '\n';
  for (std::size_t i = 0; i < behind; ++i) text += kLine;
  return text;
}

std::string longText() {
  constexpr std::size_t kLineBytes = 49;
  return linesAround(kTextBytes / kLineBytes, 0);
}

void settingText(benchmark::State& state) {
  const std::string text = longText();
  Viewer viewer;
  for ([[maybe_unused]] auto round : state) viewer.setText(text.c_str());
  state.SetBytesProcessed(state.iterations() * static_cast<int64_t>(text.size()));
}

// With one match at the end, or one in every line.
void searching(benchmark::State& state, const char* wanted) {
  const std::string text = longText();
  Viewer viewer;
  viewer.setText(text.c_str());
  for ([[maybe_unused]] auto round : state) viewer.search(text, wanted);
}

// A view into a million lines against one into a hundred.
void showingLongText(benchmark::State& state) {
  const auto fill = [](Viewer& viewer, const std::string& text) {
    viewer.setText(text.c_str());
    viewer.search(text, kNeedle);
  };
  Viewer viewerOfMany;
  Viewer viewerOfFew;
  fill(viewerOfMany, linesAround(500'000, 499'999));
  fill(viewerOfFew, linesAround(20, 79));
  const auto drawing = [](Viewer& viewer) {
    return [&viewer] {
      skia_begin_frame_c();
      viewer.show(kTicks);
    };
  };
  constexpr int kCalls = 126;  // of each
  compare(state, kCalls, drawing(viewerOfMany), drawing(viewerOfFew));
}

BENCHMARK(settingText)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(searching, one_match, kNeedle)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(searching, a_match_a_line, "sensor")->Unit(benchmark::kMillisecond);
BENCHMARK(showingLongText)->Unit(benchmark::kMicrosecond);

}  // namespace
