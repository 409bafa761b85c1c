// What the text viewer costs with texts of any length.
#include <MW/static_text.h>
#include <benchmark/benchmark.h>
#include <brimol/frame.h>

#include <string>

#include "passes.h"

namespace {

constexpr SKIA_Rect kScreen = {0, 0, 1440, 2560, 0xFFE0E0E0};
constexpr std::size_t kTextBytes = 10'000'000;
constexpr std::size_t kLineBytes = 64;
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

// So many lines of so many bytes, with their ends. The needle stands once, in the line of its
// number.
std::string linesOf(std::size_t count, std::size_t bytes, std::size_t needleLine) {
  std::string line = "12:00:00 sensor 12345 reads 0.5, as it should be";
  line.resize(bytes - 1, '.');
  std::string text;
  text.reserve(count * bytes);
  for (std::size_t i = 1; i <= count; ++i) (text += i == needleLine ? kNeedle : line) += '\n';
  return text;
}

void settingText(benchmark::State& state) {
  const auto lineBytes = static_cast<std::size_t>(state.range(0));
  const std::string text = linesOf(kTextBytes / lineBytes, lineBytes, 0);
  Viewer viewer;
  for ([[maybe_unused]] auto round : state) viewer.setText(text.c_str());
  state.SetBytesProcessed(state.iterations() * static_cast<int64_t>(text.size()));
}

void searching(benchmark::State& state, const char* wanted) {
  constexpr std::size_t kLines = kTextBytes / kLineBytes;
  const std::string text = linesOf(kLines, kLineBytes, kLines);
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
  fill(viewerOfMany, linesOf(1'000'000, kLineBytes, 500'000));
  fill(viewerOfFew, linesOf(100, kLineBytes, 20));
  const auto drawing = [](Viewer& viewer) {
    return [&viewer] {
      skia_begin_frame_c();
      viewer.show(kTicks);
    };
  };
  constexpr int kCalls = 126;  // of each
  compare(state, kCalls, drawing(viewerOfMany), drawing(viewerOfFew));
}

BENCHMARK(settingText)->Arg(kLineBytes)->Arg(kTextBytes)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(searching, at_the_end, kNeedle)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(searching, in_every_line, "reads")->Unit(benchmark::kMillisecond);
BENCHMARK(showingLongText)->Unit(benchmark::kMicrosecond);

}  // namespace
