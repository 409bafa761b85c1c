// A program of three screens, the last of which crashes where one of its buttons is pressed. With
// an argument a corner of it blinks.
#include <MW/MW.h>
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/input.h>

#include <array>
#include <atomic>
#include <cstdlib>
#include <optional>

namespace {

constexpr int kButtons = 4;
std::atomic<int> screen = 0;

struct ScreenOfButtons {
  std::array<std::optional<MW::Button>, kButtons> buttons;

  // The last button of a screen goes on, or crashes; the others go back.
  explicit ScreenOfButtons(int number) {
    for (int i = 0; i < kButtons; ++i) {
      const SKIA_Rect area = {40 + 100 * number, 100 + 160 * i, 200, 80, 0xFF406080};
      const SKIA_Text caption = {"Button", 6, MW::kColorWhite, SKIA_ALIGN_CENTRE, 30};
      MW::Button& button = buttons.at(static_cast<std::size_t>(i)).emplace(&area, &caption);
      button.clickCallback = i + 1 < kButtons ? [](int) { screen = 0; } : [](int) { goOn(); };
      button.setActive(1);
    }
    MW::isDisplayUpdate(1);
  }

  static void goOn() {
    constexpr int kLast = 2;
    if (screen == kLast) std::abort();
    ++screen;
  }
};

}  // namespace

int main(int words, char**) {
  constexpr int kBlink = 50;  // passes
  if (brimol_host_open() == 0) return 1;
  brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
  MW::Window::init();
  std::optional<ScreenOfButtons> shown;
  int number = -1;
  for (int pass = 0; brimol_host_close_requested() == 0; ++pass) {
    if (words > 1 && pass % kBlink == 0) MW::isDisplayUpdate(1);
    if (number != screen) shown.emplace(number = screen);
    if (MW::isDisplayUpdate(0) == 1) {
      skia_begin_frame_c();
      if (words > 1) skia_add_box_c({0, 0, 5, 5, pass / kBlink % 2 == 0 ? 0xFF406080 : 0xFF804060});
      MW::Window::show();
      skia_end_frame_c();
    }
    MW::Window::updateTimer(MW::kUnused);
    Delay(5);
  }
  shown.reset();
  MW::Window::destroy();
}
