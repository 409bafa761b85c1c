// What painting costs on a screen of 1440 x 2560 pixels. The counter `memsets` is the time of one
// painting, measured in memsets of such a frame: one follows each painting, and the medians of both
// are compared.

#include <benchmark/benchmark.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cstring>
#include <vector>

#include "painter/painter.h"
#include "percentile.h"

namespace {

using brimol::pc::Frame;
using brimol::pc::Painter;
using Clock = std::chrono::steady_clock;
using Seconds = std::chrono::duration<double>;

constexpr brimol::pc::Size kScreen = {1440, 2560};
constexpr std::size_t kFrameBytes = std::size_t{4} * kScreen.w * kScreen.h;

constexpr uint32_t kWhite = 0xFFFFFFFF;
constexpr uint32_t kBlack = 0xFF000000;
constexpr uint32_t kFace = 0xFFDDE6F0;
constexpr uint32_t kPressedFace = 0xFF87CEFA;
constexpr uint32_t kVeil = 0x80000000;
constexpr int32_t kCentred = 5;

SKIA_Item box(SKIA_Rect rect) { return {SKIA_BOX, rect, {}, {}}; }

SKIA_Item textItem(int32_t kind, SKIA_Rect rect, const char* words, int32_t size) {
  SKIA_Item item = {kind, rect, {}, {}};
  item.text.string_len = static_cast<int32_t>(std::strlen(words));
  std::copy_n(words, item.text.string_len, item.text.text);
  item.text.color = kBlack;
  item.text.align = kCentred;
  item.text.size = size;
  return item;
}

Frame fillOf(uint32_t color) { return {box({0, 0, kScreen.w, kScreen.h, color})}; }

// Fourteen rows of text over a ground of the given colour, scrolled by so many pixels.
Frame menuOver(uint32_t ground, int32_t scroll = 0) {
  constexpr auto kRows = std::to_array<const char*>(
      {"Touch screen", "Display colours", "Camera front", "Camera back", "Vibration", "Speaker",
       "Receiver", "Microphone", "Proximity sensor", "Light sensor", "Fingerprint", "Wireless",
       "Satellites", "Battery"});
  constexpr int32_t kRowHeight = 160;
  Frame frame = fillOf(ground);
  int32_t y = 40 - scroll;
  for (const char* const words : kRows) {
    frame.push_back(textItem(SKIA_TEXTBOX, {40, y, kScreen.w - 80, kRowHeight, kFace}, words, 64));
    y += kRowHeight + 16;
  }
  return frame;
}

// A dialog with its frame, title, three lines and two buttons over a veil over a ground.
Frame dialogOver(uint32_t ground) {
  Frame frame = fillOf(ground);
  frame.push_back(box({0, 0, kScreen.w, kScreen.h, kVeil}));
  frame.push_back({SKIA_ROUNDBOX, {120, 760, 1200, 1000, kWhite}, {}, {}});
  frame.push_back(textItem(SKIA_LABEL, {120, 780, 1200, 140, 0}, "Fingerprint", 72));
  frame.push_back(textItem(SKIA_LABEL, {160, 980, 1120, 100, 0}, "The sensor did not answer.", 56));
  frame.push_back(textItem(SKIA_LABEL, {160, 1100, 1120, 100, 0}, "Clean it and try again,", 56));
  frame.push_back(textItem(SKIA_LABEL, {160, 1220, 1120, 100, 0}, "or mark it as failed.", 56));
  frame.push_back(textItem(SKIA_ROUNDBUTTONBOX, {180, 1520, 500, 180, kFace}, "Fail", 64));
  frame.push_back(textItem(SKIA_ROUNDBUTTONBOX, {760, 1520, 500, 180, kFace}, "Again", 64));
  return frame;
}

// A menu with one button that has the given face.
Frame menuWithButton(uint32_t face) {
  Frame frame = menuOver(kWhite);
  frame.push_back(textItem(SKIA_ROUNDBUTTONBOX, {420, 2300, 600, 180, face}, "Back", 64));
  return frame;
}

template <typename Work>
double secondsOf(const Work& work) {
  const auto start = Clock::now();
  work();
  return Seconds(Clock::now() - start).count();
}

// Paints the two frames by turns; they differ where the painting is to be measured.
void paintByTurns(benchmark::State& state, const Frame& one, const Frame& other) {
  Painter painter(kScreen);
  painter.paint(one);
  painter.paint(other);
  std::vector<unsigned char> bytes(kFrameBytes);
  std::vector<double> paintings;
  std::vector<double> memsets;
  while (state.KeepRunning()) {
    const Frame& next = paintings.size() % 2 == 0 ? one : other;
    paintings.push_back(secondsOf([&painter, &next] { painter.paint(next); }));
    state.SetIterationTime(paintings.back());
    const int value = static_cast<int>(paintings.size() % 2);
    memsets.push_back(secondsOf([&bytes, value] {
      std::memset(bytes.data(), value, bytes.size());
      benchmark::DoNotOptimize(bytes.data());
      benchmark::ClobberMemory();
    }));
  }
  state.counters["memsets"] = median(paintings) / median(memsets);
}

void fullFill(benchmark::State& state) { paintByTurns(state, fillOf(kFace), fillOf(kPressedFace)); }

void menu(benchmark::State& state) { paintByTurns(state, menuOver(kWhite), menuOver(kFace)); }

// A finger's step: the ground stays, every row moves.
void scrolling(benchmark::State& state) {
  paintByTurns(state, menuOver(kWhite), menuOver(kWhite, 12));
}

void veilWithDialog(benchmark::State& state) {
  paintByTurns(state, dialogOver(kWhite), dialogOver(kFace));
}

void oneButton(benchmark::State& state) {
  paintByTurns(state, menuWithButton(kFace), menuWithButton(kPressedFace));
}

constexpr double kSeconds = 0.5;
BENCHMARK(fullFill)->UseManualTime()->MinTime(kSeconds)->Unit(benchmark::kMicrosecond);
BENCHMARK(menu)->UseManualTime()->MinTime(kSeconds)->Unit(benchmark::kMicrosecond);
BENCHMARK(scrolling)->UseManualTime()->MinTime(kSeconds)->Unit(benchmark::kMicrosecond);
BENCHMARK(veilWithDialog)->UseManualTime()->MinTime(kSeconds)->Unit(benchmark::kMicrosecond);
BENCHMARK(oneButton)->UseManualTime()->MinTime(kSeconds)->Unit(benchmark::kMicrosecond);

}  // namespace

BENCHMARK_MAIN();
