// An application up to its first frame: a menu in a window's place. Prints, for start_bench, when
// the frame was painted, in nanoseconds of the steady clock, and the kilobytes that are resident
// then.
#include <MW/main_list.h>
#include <MW/window.h>
#include <android/log.h>
#include <brimol/frame.h>
#include <brimol/host.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdio>
#include <future>
#include <string_view>

#include "host/open_platform.h"
#include "resident.h"

namespace {

using Clock = std::chrono::steady_clock;

constexpr auto kRows = std::to_array<std::string_view>(
    {"Touch screen", "Display colours", "Camera front", "Camera back", "Vibration", "Speaker",
     "Receiver", "Microphone", "Proximity sensor", "Light sensor", "Fingerprint", "Wireless"});

void addRow(MW::MainList& menu, std::string_view words) {
  constexpr int kRowHeight = 160;
  SKIA_Text text = {};
  text.size = 64;
  text.string_len = static_cast<int32_t>(words.size());
  std::ranges::copy(words, text.text);
  menu.addIndex(MW::MainList::kSelectable, &text, kRowHeight);
}

// What the platform's thread does next after it has painted the frame.
Clock::time_point timeOfPaintedFrame() {
  std::promise<Clock::time_point> painted;
  brimol::pc::openedPlatform()->act(
      [&painted](brimol::pc::InputTranslator&) { painted.set_value(Clock::now()); });
  return painted.get_future().get();
}

}  // namespace

int main() {
  __android_log_set_minimum_priority(ANDROID_LOG_SILENT);
  if (brimol_host_open() == 0) return 1;
  brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
  MW::Window::init();
  {
    MW::MainList menu("A factory test", 1);
    for (const std::string_view words : kRows) addRow(menu, words);
    menu.initFinish();
    menu.setActive(1);
    skia_begin_frame_c();
    MW::Window::show();
    skia_end_frame_c();
    const auto painted = timeOfPaintedFrame().time_since_epoch();
    std::printf("%lld %ld\n", static_cast<long long>(std::chrono::nanoseconds(painted).count()),
                residentKb());
    std::fflush(stdout);
  }
  MW::Window::destroy();
}
